// Conversions between the platform's UTF-16 strings and the host's UTF-8.
#pragma once

#include <string>

#include "platform/types.h"

namespace platform {

std::string ToUtf8(const WCHAR* s, int count = -1);
std::u16string ToUtf16(const std::string& s);

}  // namespace platform
