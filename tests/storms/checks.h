// What must hold after each step, whatever the host did.
#pragma once

#include "storms/stage.h"

namespace kortest {

// By messages, exports, and the records that windows keep in their user data. Of the strips, charts
// and bars those that the step had to do with.
void CheckStage(Stage& stage);

// Inside a notification: it tells what the exports tell.
void CheckNotification(Stage& stage, UINT message, WPARAM wParam, LPARAM lParam);

}  // namespace kortest
