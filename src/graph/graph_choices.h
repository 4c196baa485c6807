// The chart types and zooms as they stand in combo boxes. An item's place is also its number in the
// chart's messages.
#pragma once

namespace kor {

constexpr const wchar_t* kTypeChoices[] = {L"Line", L"Area", L"Bar", L"Column", L"Pie"};
constexpr const wchar_t* kZoomChoices[] = {L"25%", L"50%", L"100%", L"200%"};

}  // namespace kor
