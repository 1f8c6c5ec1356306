#pragma once

#include "platform/draw/color.h"
#include "tests/render/contrast.h"

namespace feltside::tests {

// In what type and colour the table's texts are written.

inline constexpr platform::Color kRed = platform::Rgb(200, 0, 0);

inline const Style kNormal{{11}};
inline const Style kMessage{{11}, kRed};
inline const Style kTotal{{11, true}, kRed};
inline const Style kResult{{14, true}, kRed};
inline const Style kBox{{13}};
inline const Style kBoxTitle{{13, true}};
inline const Style kAdvice{{13}, kRed};
inline const Style kCell{{15, true}, platform::kWhite};
// Both colours are fixed.
inline const Style kResultCell{{15, true}, platform::Rgb(180, 0, 0), kOnlyListed};
inline const Style kButton{{22}, platform::kBlack, kOnlyListed};
inline const Style kAmount{{11}, platform::Rgb(91, 152, 139), kOnlyListed};

}  // namespace feltside::tests
