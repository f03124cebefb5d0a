// Writes a surface as a PNG file, each pixel scaled to scale x scale.
#pragma once

#include <string>

#include "platform/core/surface.h"

namespace platform {

bool WritePng(const std::string& path, const Surface& surface, int scale);

}  // namespace platform
