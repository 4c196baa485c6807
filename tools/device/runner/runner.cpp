// korcontrols.dll as the tests load it when they run on the device's image: it stands in for that
// image, which it interprets. See docs/device-runner.md.
#include "runner/callbacks.h"
#include "runner/counters.h"
#include "runner/exports.h"
#include "runner/guest_calls.h"
#include "runner/image.h"
#include "runner/imports.h"
#include "runner/own_headers.h"
#include "runner/profile.h"

#include <windows.h>

namespace device {
namespace {

// The folder beside this module that holds what the runner needs.
std::wstring FolderBeside(HMODULE self) {
    wchar_t path[MAX_PATH] = L"";
    GetModuleFileNameW(self, path, MAX_PATH);
    const std::wstring whole = path;
    return whole.substr(0, whole.find_last_of(L'\\') + 1) + L"device\\";
}

// The block of arithmetic helpers as the image contains it, so that they can be counted. Without
// the file they are not distinguished.
void ReadSoftFloat(const std::wstring& path) {
    const HANDLE file = CreateFileW(path.c_str(), GENERIC_READ, FILE_SHARE_READ, nullptr,
                                    OPEN_EXISTING, 0, nullptr);
    if (file == INVALID_HANDLE_VALUE) return;
    std::vector<uint8_t> block(GetFileSize(file, nullptr));
    DWORD read = 0;
    ReadFile(file, block.data(), static_cast<DWORD>(block.size()), &read, nullptr);
    CloseHandle(file);
    if (read) FindSoftFloat(block.data(), read);
}

bool CallEntryPoint(HMODULE self, DWORD reason) {
    const uint32_t words[] = {reinterpret_cast<uint32_t>(self), reason, 0};
    return static_cast<uint32_t>(
               CallGuest(guest.entry, words, 3, reinterpret_cast<uint32_t>(words))) != 0;
}

bool Attach(HMODULE self) {
    const DWORD error = GetLastError();
    DisableThreadLibraryCalls(self);
    const std::wstring folder = FolderBeside(self);
    LoadImageFile(folder + L"korcontrols.dll");
    PrepareCounters();
    PrepareProfile();
    ReadSoftFloat(folder + L"arithmetic.bin");
    PrepareGuestCalls();
    BindImports();
    ConnectExports();
    ShowGuestImports();
    ShowGuestResources();
    ProtectImage();
    CatchCallbacks();
    SetLastError(error);
    return CallEntryPoint(self, DLL_PROCESS_ATTACH);
}

}  // namespace
}  // namespace device

extern "C" BOOL WINAPI DllMain(HINSTANCE self, DWORD reason, void*) {
    if (reason == DLL_PROCESS_ATTACH) return device::Attach(self);
    if (reason == DLL_PROCESS_DETACH) {
        device::CallEntryPoint(self, reason);
        device::WriteProfile();
    }
    return TRUE;
}
