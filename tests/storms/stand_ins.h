// Parts of the platform that would wait for somebody, or for the clock.
#pragma once

namespace kortest {

class Stage;

// No timer of the library's runs: a storm sends WM_TIMER itself. A menu asks for its entries'
// sizes and pictures, and chooses by itself.
void ReplaceWaiting();

}  // namespace kortest
