#include "Tools/VelmoraLog.h"

int main(int count, char** arguments) {
    return velmora::runVelmoraLog(count, arguments);
}
