#pragma once

#include <string>
#include <vector>

namespace platform {

class CTopWindow;

/// Short texts of which each tells one thing. Those without a stop get one when they are told; an
/// empty one tells nothing.
using Phrases = std::vector<std::string>;

/// Tells the topmost window to a person who does not see it, by the host's voice, as far as it was
/// not told before. The last of its phrases closes whatever is told.
class CNarrator {
 public:
  /// Says nothing where nothing is new.
  void TellOf(const CTopWindow& window);
  /// Has all that there is told next time.
  void Forget() { m_arrTold.clear(); }

 private:
  Phrases m_arrTold;  ///< what the person knows
};

}  // namespace platform
