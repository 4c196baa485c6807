// The panel on the screen by which a device without a keyboard takes text.
#pragma once

namespace kor {

// Each does nothing where the panel is in that state already, or where there is none.
void ShowInputPanel();
void HideInputPanel();

}  // namespace kor
