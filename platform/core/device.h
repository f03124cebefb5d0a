// The device file system: a host folder standing in for the handheld's root.
#pragma once

#include <string>

#include "platform/types.h"

namespace platform {

// The host folder that "\" maps to; set by the host before WinMain.
void SetDeviceRoot(const std::string& hostFolder);
const std::string& DeviceRoot();

// The host path of an existing file or folder for a device path such as "\Program Files\x.dc8",
// each name matched without regard to case. Empty when there is no such entry.
std::string ResolveDevicePath(const std::string& devicePath);

// Storage faults for tests: from now on, a ReadFile that would read the byte at offset (or
// beyond) fails, as on a card with a bad block. A negative offset turns it off.
void InjectReadFailure(long long offset);
long long InjectedReadFailure();

}  // namespace platform
