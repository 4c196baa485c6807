// The host's command bar: its tooltip texts.
#pragma once

namespace kor {

// The first button shows the chart or, while that is to be seen, the grid; its tooltip says so.
void ReloadShowGraphToolTip(bool isGraphShown);

}  // namespace kor
