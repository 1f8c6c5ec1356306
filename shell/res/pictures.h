#pragma once

#include "platform/draw/embedded.h"

namespace feltside {

/// The pictures and icons of this folder, as they were built into the program.
platform::EmbeddedFiles PictureFiles();

}  // namespace feltside
