#include "platform/procedures.h"

#include "base/module.h"
#include "base/runtime.h"

namespace kor {

namespace {

constexpr DWORD kPathCapacity = MAX_PATH;

// The folder of a module with its trailing backslash; that of the program for a null module.
class ModuleFolder {
public:
    explicit ModuleFolder(HMODULE module) noexcept {
        const DWORD length = GetModuleFileNameW(module, path_, kPathCapacity);
        if (length < kPathCapacity) length_ = length;  // a longer path has been truncated
        while (length_ > 0 && path_[length_ - 1] != L'\\') --length_;
        path_[length_] = L'\0';
    }

    bool IsSame(const ModuleFolder& other) const noexcept {
        return lstrcmpiW(path_, other.path_) == 0;
    }

    // Loads a file of this folder.
    HMODULE Load(const wchar_t* name) const noexcept {
        const size_t nameLength = wcslen(name);
        if (length_ == 0 || length_ + nameLength >= kPathCapacity) return nullptr;
        wchar_t file[kPathCapacity];
        memcpy(file, path_, length_ * sizeof(wchar_t));
        memcpy(file + length_, name, (nameLength + 1) * sizeof(wchar_t));
        return LoadLibraryW(file);
    }

private:
    wchar_t path_[kPathCapacity];
    size_t length_ = 0;
};

}  // namespace

HMODULE LoadPrintModule(const wchar_t* name) {
    const ModuleFolder program(nullptr);
    if (HMODULE module = program.Load(name)) return module;
    const ModuleFolder library(moduleInstance);
    return library.IsSame(program) ? nullptr : library.Load(name);
}

FARPROC FindProcedure(HMODULE module, const wchar_t* name) {
    constexpr int kCapacity = 64;
    constexpr wchar_t kLastLatin = 0x7E;
    char narrow[kCapacity];
    int length = 0;
    for (; name[length]; ++length) {
        if (length == kCapacity - 1 || name[length] > kLastLatin) return nullptr;
        narrow[length] = static_cast<char>(name[length]);
    }
    narrow[length] = '\0';
    return GetProcAddress(module, narrow);
}

}  // namespace kor
