// Another program at the clipboard.
//
//   clipboard_partner read FILE        writes the CF_DIB on the clipboard to a file
//   clipboard_partner hold EVENT END   opens the clipboard, sets the first event,
//                                      and closes it when the second is set
//
// Exit status 0, or 1 when that was not possible.
#include <windows.h>

#include <cstdio>
#include <cstring>

namespace {

constexpr DWORD kPatienceMilliseconds = 30000;

bool WriteBlock(HANDLE block, const char* path) {
    const SIZE_T size = block ? GlobalSize(block) : 0;
    const void* bytes = block ? GlobalLock(block) : nullptr;
    if (!bytes) return false;
    std::FILE* file = std::fopen(path, "wb");
    const bool isWritten = file && std::fwrite(bytes, 1, size, file) == size;
    if (file) std::fclose(file);
    GlobalUnlock(block);
    return isWritten;
}

bool Read(const char* path) {
    if (!OpenClipboard(nullptr)) return false;
    const bool isWritten = WriteBlock(GetClipboardData(CF_DIB), path);
    CloseClipboard();
    return isWritten;
}

bool Hold(const char* openedName, const char* endName) {
    const HANDLE opened = OpenEventA(EVENT_MODIFY_STATE, FALSE, openedName);
    const HANDLE end = OpenEventA(SYNCHRONIZE, FALSE, endName);
    const HWND owner = CreateWindowExW(0, L"STATIC", L"", WS_POPUP, 0, 0, 1, 1, nullptr, nullptr,
                                       GetModuleHandleW(nullptr), nullptr);
    if (!opened || !end || !OpenClipboard(owner)) return false;
    SetEvent(opened);
    const bool isEnded = WaitForSingleObject(end, kPatienceMilliseconds) == WAIT_OBJECT_0;
    CloseClipboard();
    return isEnded;
}

}  // namespace

int main(int count, char** words) {
    if (count == 3 && std::strcmp(words[1], "read") == 0) return Read(words[2]) ? 0 : 1;
    if (count == 4 && std::strcmp(words[1], "hold") == 0) return Hold(words[2], words[3]) ? 0 : 1;
    return 1;
}
