#pragma once

#include "platform/window/document_template.h"

namespace feltside {

/// The document of the program. It holds nothing: the view has the whole state of the game.
class CFeltsideDoc : public platform::CDocument {};

}  // namespace feltside
