// No input panel: a desktop has a keyboard.
#include "platform/input_panel.h"

namespace kor {

void ShowInputPanel() {}

void HideInputPanel() {}

}  // namespace kor
