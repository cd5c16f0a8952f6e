#include "daemon/kvd.h"

HostConnectionID gKVDConnection = 0;
HostRunLoopRef gRunLoop;
HostSourceRef gServicePortSource;
bool gScreenLocked = false;
std::uint32_t gApplicationListSeed = 0;
bool gRemoteUIRunning = false;
bool gRemoteUIVisible = false;
