// Access rights of files, as the system writes them down (SDDL).
#ifndef TESTS_WORKBOOK_FILE_RIGHTS_H
#define TESTS_WORKBOOK_FILE_RIGHTS_H

#include <string>

namespace workbook {

// Everybody may do everything.
constexpr const wchar_t* kEverybodysRights = L"D:(A;;FA;;;WD)";

// Only who runs the tests may.
std::wstring OwnRights();

void SetRights(const std::wstring& path, const std::wstring& rights);
std::wstring RightsOfFile(const std::wstring& path);

}  // namespace workbook

#endif
