#pragma once

#include <filesystem>
#include <string>

#include "platform/draw/bitmap.h"

namespace feltside::tests {

/// The picture in a PNG file; an empty one where there is none.
platform::CBitmap ReadPicture(const std::filesystem::path& path);

/// Fails the test where two pictures differ, and leaves the actual one and the difference under
/// this name in the folder golden-diff of the build.
void ExpectSame(const platform::CBitmap& actual, const platform::CBitmap& expected,
                const std::string& name);

/// The same with the stored picture of that name. With FELTSIDE_RENEW_GOLDEN=1 in the environment
/// it stores the picture instead.
void ExpectGolden(const platform::CBitmap& actual, const std::string& name);

}  // namespace feltside::tests
