#pragma once

#include <optional>
#include <string>

#include "platform/store/profile.h"

namespace platform {

/// The integers and strings that the sections of a TOML text hold; nothing where the text cannot be
/// understood.
std::optional<CProfileSections> ReadSections(const std::string& text);

struct ChangedText {
  std::string text;
  /// The first name whose value was not of the kind that has taken its place; empty: there is none.
  std::string foreign;
};

/// A TOML text, which can be understood, with the changes of a section in it and all else as it was
/// but for its form. Nothing where the outcome could not be understood again, as what was deep may
/// have become deeper.
std::optional<ChangedText> ChangeSection(const std::string& text, const std::string& section,
                                         const CProfileSection& change);

}  // namespace platform
