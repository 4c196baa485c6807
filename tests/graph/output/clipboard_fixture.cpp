#include "graph/output/clipboard_fixture.h"

#include <cstdio>
#include <cstring>

namespace kortest {
namespace {

constexpr DWORD kPatienceMilliseconds = 30000;
constexpr size_t kColourCount = 19;

std::string ProgramFolder() {
    char path[MAX_PATH] = {};
    GetModuleFileNameA(nullptr, path, MAX_PATH);
    const std::string whole = path;
    return whole.substr(0, whole.find_last_of('\\') + 1);
}

HANDLE StartPartner(const std::string& words) {
    std::string command = "\"" + ProgramFolder() + "clipboard_partner.exe\" " + words;
    STARTUPINFOA start{};
    start.cb = sizeof start;
    PROCESS_INFORMATION process{};
    EXPECT_TRUE(CreateProcessA(nullptr, command.data(), nullptr, nullptr, FALSE, 0, nullptr,
                               nullptr, &start, &process))
        << command;
    CloseHandle(process.hThread);
    return process.hProcess;
}

// False also after a long wait, at whose end the process is stopped.
bool EndedWell(HANDLE process) {
    DWORD status = 1;
    if (WaitForSingleObject(process, kPatienceMilliseconds) != WAIT_OBJECT_0)
        TerminateProcess(process, 1);
    GetExitCodeProcess(process, &status);
    CloseHandle(process);
    return status == 0;
}

Bytes ReadFileBytes(const std::string& path) {
    Bytes bytes;
    std::FILE* file = std::fopen(path.c_str(), "rb");
    if (!file) return bytes;
    for (int byte = std::fgetc(file); byte != EOF; byte = std::fgetc(file))
        bytes.push_back(static_cast<unsigned char>(byte));
    std::fclose(file);
    return bytes;
}

Bytes CopyBlock(HANDLE block) {
    if (!block) return {};
    const auto* first = static_cast<const unsigned char*>(GlobalLock(block));
    Bytes bytes(first, first + GlobalSize(block));
    GlobalUnlock(block);
    return bytes;
}

std::string EventName(const char* role) {
    return "korcontrols clipboard " + std::to_string(GetCurrentProcessId()) + role;
}

}  // namespace

Bytes ReadClipboard() {
    EXPECT_TRUE(OpenClipboard(nullptr));
    Bytes bytes;
    if (IsClipboardFormatAvailable(CF_DIB)) bytes = CopyBlock(GetClipboardData(CF_DIB));
    CloseClipboard();
    return bytes;
}

Bytes ReadClipboardElsewhere() {
    char folder[MAX_PATH] = {}, path[MAX_PATH] = {};
    GetTempPathA(MAX_PATH, folder);
    GetTempFileNameA(folder, "dib", 0, path);
    EXPECT_TRUE(EndedWell(StartPartner("read \"" + std::string(path) + "\"")));
    const Bytes bytes = ReadFileBytes(path);
    DeleteFileA(path);
    return bytes;
}

void PutText(const std::wstring& text) {
    ASSERT_TRUE(OpenClipboard(nullptr));
    EmptyClipboard();
    const size_t size = (text.size() + 1) * sizeof(wchar_t);
    const HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE, size);
    std::memcpy(GlobalLock(block), text.c_str(), size);
    GlobalUnlock(block);
    EXPECT_NE(SetClipboardData(CF_UNICODETEXT, block), nullptr);
    CloseClipboard();
}

std::wstring ClipboardText() {
    EXPECT_TRUE(OpenClipboard(nullptr));
    std::wstring text;
    if (const HANDLE block = GetClipboardData(CF_UNICODETEXT)) {
        text = static_cast<const wchar_t*>(GlobalLock(block));
        GlobalUnlock(block);
    }
    CloseClipboard();
    return text;
}

ClipboardTurn::ClipboardTurn() : mutex_(CreateMutexA(nullptr, FALSE, "korcontrols clipboard")) {
    EXPECT_NE(WaitForSingleObject(mutex_, 3 * kPatienceMilliseconds), WAIT_TIMEOUT);
}

ClipboardTurn::~ClipboardTurn() {
    ReleaseMutex(mutex_);
    CloseHandle(mutex_);
}

ColourDib ParseDib(const Bytes& bytes) {
    constexpr size_t kHead = sizeof(BITMAPINFOHEADER) + kColourCount * sizeof(RGBQUAD);
    ColourDib dib{};
    if (bytes.size() < kHead) {
        ADD_FAILURE() << "only " << bytes.size() << " bytes";
        return dib;
    }
    std::memcpy(&dib.header, bytes.data(), sizeof dib.header);
    const int width = dib.header.biWidth, height = dib.header.biHeight;
    const size_t row = (static_cast<size_t>(width) + 3) / 4 * 4;
    EXPECT_EQ(bytes.size(), kHead + row * static_cast<size_t>(height));
    for (size_t i = 0; i < kColourCount; ++i) {
        const unsigned char* quad = bytes.data() + sizeof dib.header + i * sizeof(RGBQUAD);
        EXPECT_EQ(quad[3], 0) << "reserved, of colour " << i;
        dib.colours.push_back(RGB(quad[2], quad[1], quad[0]));
    }
    dib.picture = Picture(width, height, CLR_INVALID);
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            const size_t fromBottom = static_cast<size_t>(height - 1 - y);
            const size_t place = kHead + fromBottom * row + static_cast<size_t>(x);
            dib.picture.setPixel(x, y, dib.colours.at(bytes.at(place)));
        }
    }
    return dib;
}

ClipboardHeldElsewhere::ClipboardHeldElsewhere()
    : opened_(CreateEventA(nullptr, TRUE, FALSE, EventName("opened").c_str())),
      end_(CreateEventA(nullptr, TRUE, FALSE, EventName("end").c_str())),
      process_(StartPartner("hold \"" + EventName("opened") + "\" \"" + EventName("end") + "\"")) {
    EXPECT_EQ(WaitForSingleObject(opened_, kPatienceMilliseconds), WAIT_OBJECT_0);
}

ClipboardHeldElsewhere::~ClipboardHeldElsewhere() {
    SetEvent(end_);
    EXPECT_TRUE(EndedWell(process_));
    CloseHandle(opened_);
    CloseHandle(end_);
}

}  // namespace kortest
