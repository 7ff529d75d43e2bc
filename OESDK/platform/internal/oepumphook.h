// Internal to the platform layer (not installed): the host pump hook that the per-OS message
// pumps share.
#ifndef OESDK_PLATFORM_INTERNAL_OEPUMPHOOK_H
#define OESDK_PLATFORM_INTERNAL_OEPUMPHOOK_H

namespace OEPlatform {

// Runs the host's pump hook, if one is installed. Returns 1 when it asked to quit, else 0.
int RunPumpHook();

} // namespace OEPlatform

#endif
