#include "graph/tools/dialog_template.h"

#include "support/message_text.h"

#include <gtest/gtest.h>

#include <cstring>
#include <ostream>

namespace kortest {
namespace {

// Reads the words of a template one after the other.
class Words {
public:
    explicit Words(const WORD* first) : first_(first), next_(first) {}

    int word() { return *next_++; }
    int signedWord() { return static_cast<SHORT>(word()); }
    DWORD doubleWord() {
        const auto low = static_cast<DWORD>(word());
        return low | static_cast<DWORD>(word()) << 16;
    }

    // A text, or 0xFFFF and a number, which comes out as that character.
    std::wstring textOrOrdinal() {
        if (*next_ == 0xFFFF) {
            ++next_;
            return std::wstring(1, static_cast<wchar_t>(word()));
        }
        std::wstring text;
        while (const int character = word()) text.push_back(static_cast<wchar_t>(character));
        return text;
    }

    void alignToDoubleWord() { next_ += (next_ - first_) % 2; }

private:
    const WORD* first_;
    const WORD* next_;
};

std::wstring ClassName(const std::wstring& stored) {
    if (stored == L"\x80") return L"BUTTON";
    if (stored == L"\x81") return L"EDIT";
    if (stored == L"\x82") return L"STATIC";
    if (stored == L"\x85") return L"COMBOBOX";
    return stored;
}

DialogItem ReadItem(Words& words) {
    words.alignToDoubleWord();
    DialogItem item{};
    item.style = words.doubleWord();
    EXPECT_EQ(words.doubleWord(), 0u) << "extended style";
    item.x = words.signedWord();
    item.y = words.signedWord();
    item.width = words.signedWord();
    item.height = words.signedWord();
    item.id = words.signedWord();
    item.className = ClassName(words.textOrOrdinal());
    item.text = words.textOrOrdinal();
    EXPECT_EQ(words.word(), 0) << "creation data";
    return item;
}

}  // namespace

DialogTemplate ReadDialogTemplate(HMODULE module, int id) {
    DialogTemplate dialog{};
    const HRSRC resource = FindResourceW(module, MAKEINTRESOURCEW(id), RT_DIALOG);
    if (!resource) {
        ADD_FAILURE() << "no dialog " << id;
        return dialog;
    }
    Words words(static_cast<const WORD*>(LockResource(LoadResource(module, resource))));
    dialog.style = words.doubleWord();
    EXPECT_NE(dialog.style, 0xFFFF0001u) << "an extended template";
    EXPECT_EQ(words.doubleWord(), 0u) << "extended style";
    const int count = words.word();
    EXPECT_EQ(words.word(), 0) << "x";
    EXPECT_EQ(words.word(), 0) << "y";
    dialog.width = words.word();
    dialog.height = words.word();
    EXPECT_EQ(words.textOrOrdinal(), L"") << "menu";
    EXPECT_EQ(words.textOrOrdinal(), L"") << "class";
    dialog.caption = words.textOrOrdinal();
    dialog.fontPoints = words.word();
    dialog.font = words.textOrOrdinal();
    for (int i = 0; i < count; ++i) dialog.items.push_back(ReadItem(words));
    return dialog;
}

void PrintTo(const DialogItem& item, std::ostream* stream) {
    *stream << Narrow(item.className.c_str()) << " " << item.id << " \""
            << Narrow(item.text.c_str()) << "\" " << std::hex << item.style << std::dec << " at "
            << item.x << "," << item.y << " size " << item.width << "," << item.height;
}

}  // namespace kortest
