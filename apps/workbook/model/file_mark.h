// What a file holds, in few bytes: enough to notice later that it holds something else.
#ifndef WORKBOOK_MODEL_FILE_MARK_H
#define WORKBOOK_MODEL_FILE_MARK_H

#include <cstdint>
#include <string_view>

namespace workbook {

// The length and a digest (FNV-1a). Neither time nor attributes count: a file that was only touched
// is the same.
class FileMark {
public:
    void add(std::string_view bytes) noexcept {
        length_ += bytes.size();
        for (const char byte : bytes)
            digest_ = (digest_ ^ static_cast<unsigned char>(byte)) * 0x100000001B3;
    }
    std::uint64_t length() const noexcept { return length_; }

    friend bool operator==(const FileMark&, const FileMark&) = default;

private:
    std::uint64_t length_ = 0;
    std::uint64_t digest_ = 0xCBF29CE484222325;
};

inline FileMark MarkOf(std::string_view bytes) noexcept {
    FileMark mark;
    mark.add(bytes);
    return mark;
}

}  // namespace workbook

#endif
