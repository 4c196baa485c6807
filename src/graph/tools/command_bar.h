// The host's command bar: its tooltip texts.
#pragma once

namespace kor {

// The first button shows the chart or, while the chart is visible, the grid. Its tooltip says
// which.
void ReloadShowGraphToolTip(bool isGraphShown);

}  // namespace kor
