#include "file_io.h"

#include "last_words.h"
#include "new_file.h"

#include <new>

namespace workbook {

namespace {

constexpr size_t kChunk = size_t{1} << 20;  // bytes per call to the system

// The system's sentence for an error number, without the line break at its end.
std::wstring SystemMessage(DWORD error) {
    wchar_t buffer[512];
    DWORD length = FormatMessageW(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS,
                                  nullptr, error, 0, buffer, 512, nullptr);
    while (length > 0 && (buffer[length - 1] == L'\n' || buffer[length - 1] == L'\r')) --length;
    if (length == 0) return L"System error " + std::to_wstring(error) + L".";
    return {buffer, length};
}

FileProblem ProblemWith(const wchar_t* what, const std::wstring& path, const std::wstring& why) {
    return {std::wstring(what) + L" \"" + path + L"\": " + why};
}

FileProblem CannotRead(const std::wstring& path, DWORD error) {
    return ProblemWith(L"Cannot read", path, SystemMessage(error));
}

FileProblem CannotWrite(const std::wstring& path, DWORD error) {
    return ProblemWith(L"Cannot write", path, SystemMessage(error));
}

std::wstring TooLargeMessage(size_t largest) {
    return L"The file is larger than " + std::to_wstring(largest >> 20) + L" MB.";
}

FileContents ReadUnguarded(const std::wstring& path, size_t largest) {
    FileHandle file(CreateFileW(path.c_str(), GENERIC_READ, FILE_SHARE_READ | FILE_SHARE_DELETE,
                                nullptr, OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!file.isOpen()) return {{}, CannotRead(path, GetLastError())};
    LARGE_INTEGER size{};
    if (!GetFileSizeEx(file.get(), &size)) return {{}, CannotRead(path, GetLastError())};
    if (static_cast<unsigned long long>(size.QuadPart) > largest)
        return {{}, ProblemWith(L"Cannot open", path, TooLargeMessage(largest))};

    FileContents contents;
    for (;;) {
        const size_t known = contents.bytes.size();
        contents.bytes.resize(known + kChunk);
        DWORD count = 0;
        if (!ReadFile(file.get(), contents.bytes.data() + known, kChunk, &count, nullptr))
            return {{}, CannotRead(path, GetLastError())};
        contents.bytes.resize(known + count);
        if (count == 0) return contents;
        if (contents.bytes.size() > largest)
            return {{}, ProblemWith(L"Cannot open", path, TooLargeMessage(largest))};
    }
}

// ---- Replacing ----

FileHandle OpenForAll(const std::wstring& path, DWORD access) {
    return FileHandle(CreateFileW(path.c_str(), access,
                                  FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                                  OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
}

// Whose place is taken, and what it hands down.
struct OldFile {
    std::wstring place;                // behind links
    std::optional<FileNature> nature;  // nothing: there is no file yet
};

//   result  the error number
DWORD Examine(const std::wstring& path, OldFile& old) {
    old.place = path;
    // To write, too: a file that may not be written may not be replaced either.
    const FileHandle file = OpenForAll(path, GENERIC_READ | FILE_WRITE_DATA);
    if (!file.isOpen()) {
        const DWORD error = GetLastError();
        return error == ERROR_FILE_NOT_FOUND ? ERROR_SUCCESS : error;
    }
    old.nature = NatureOf(file.get());
    if (!old.nature) return GetLastError();
    if ((old.nature->basic.FileAttributes & FILE_ATTRIBUTE_READONLY) != 0)
        return ERROR_ACCESS_DENIED;
    old.place = PlaceOf(file.get(), path);
    return ERROR_SUCCESS;
}

// Reads on while the file may still hold what is expected.
//   result  the error number
DWORD Compare(HANDLE file, const FileMark& expected, bool& isSame) {
    FileMark mark;
    std::string bytes(kChunk, '\0');
    DWORD count = 1;
    while (count > 0 && mark.length() <= expected.length()) {
        if (!ReadFile(file, bytes.data(), kChunk, &count, nullptr)) return GetLastError();
        mark.add(std::string_view(bytes).substr(0, count));
    }
    isSame = mark == expected;
    return ERROR_SUCCESS;
}

FileProblem RemovedByOthers(const std::wstring& path) {
    return {L"\"" + path +
                L"\" is no longer there. Another program has deleted, moved or renamed it.",
            FileProblemKind::RemovedByOthers};
}

FileProblem ChangedByOthers(const std::wstring& path) {
    return {L"\"" + path +
                L"\" has been changed by another program since it was opened or saved here.",
            FileProblemKind::ChangedByOthers};
}

// Whether somebody else has been at the file. It is opened anew: many programs write a file by
// putting another one in its place.
std::optional<FileProblem> CheckOthers(const std::wstring& path, const FileMark& expected) {
    const FileHandle file = OpenForAll(path, GENERIC_READ);
    if (!file.isOpen()) {
        const DWORD error = GetLastError();
        if (error == ERROR_FILE_NOT_FOUND) return RemovedByOthers(path);
        return CannotWrite(path, error);
    }
    bool isSame = false;
    const DWORD error = Compare(file.get(), expected, isSame);
    if (error != ERROR_SUCCESS) return CannotWrite(path, error);
    if (!isSame) return ChangedByOthers(path);
    return std::nullopt;
}

std::optional<FileProblem> ReplaceUnguarded(const std::wstring& path, std::string_view bytes,
                                            const std::optional<FileMark>& expected) {
    OldFile old;
    const DWORD error = Examine(path, old);
    if (error != ERROR_SUCCESS) return CannotWrite(path, error);

    NewFile file;
    if (!file.create(old.place, old.nature) || !file.write(bytes))
        return CannotWrite(path, GetLastError());
    // As late as possible: what others write from here on is lost.
    if (expected) {
        if (auto problem = CheckOthers(path, *expected)) return problem;
    }
    if (!file.moveTo(old.place)) return CannotWrite(path, GetLastError());
    return std::nullopt;
}

}  // namespace

FileContents ReadWholeFile(const std::wstring& path, size_t largest) noexcept {
    try {
        return ReadUnguarded(path, largest);
    } catch (const std::bad_alloc&) {
        return {{}, FileProblem{TextOrNothing(L"There is not enough memory to read the file.")}};
    }
}

std::optional<FileProblem> ReplaceFileBytes(const std::wstring& path, std::string_view bytes,
                                            const std::optional<FileMark>& expected) noexcept {
    try {
        return ReplaceUnguarded(path, bytes, expected);
    } catch (const std::bad_alloc&) {
        return FileProblem{TextOrNothing(L"There is not enough memory to write the file.")};
    }
}

}  // namespace workbook
