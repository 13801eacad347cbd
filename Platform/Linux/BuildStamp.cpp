#include "Platform/Linux/BuildStamp.h"

namespace velmora {

const char* programBuildStamp() {
    return __DATE__ " " __TIME__;
}

} // namespace velmora
