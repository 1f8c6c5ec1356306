#pragma once

#include <string>

#include "platform/bitmap.h"

namespace feltside::tests {

/// Fails the test where a picture differs from the stored one of that name, and leaves both and
/// their difference in the folder golden-diff of the build. With FELTSIDE_RENEW_GOLDEN=1 in the
/// environment it stores the picture instead.
void ExpectGolden(const platform::CBitmap& actual, const std::string& name);

}  // namespace feltside::tests
