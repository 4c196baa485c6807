// The on-screen panel for text input on devices without a keyboard.
#pragma once

namespace kor {

// Each does nothing when the panel is already in that state, or when there is none.
void ShowInputPanel();
void HideInputPanel();

}  // namespace kor
