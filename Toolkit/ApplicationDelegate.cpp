#include "Toolkit/ApplicationDelegate.h"

namespace velmora {

void ApplicationDelegate::applicationWillTerminate(Application& /*application*/) {}

} // namespace velmora
