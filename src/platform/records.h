// Records of windows, from the global allocation operators.
#pragma once

#include "platform/platform.h"

#include <new>
#include <type_traits>

namespace kor {

// A zero-filled record, or null when there is no memory.
template <typename Record>
Record* NewRecord() {
    static_assert(std::is_trivially_copyable_v<Record>);
    void* memory = ::operator new(sizeof(Record));
    return memory ? ::new (memory) Record() : nullptr;
}

template <typename Record>
void DeleteRecord(Record* record) {
    ::operator delete(record);
}

// The record in a window's user data.
template <typename Record>
Record* UserDataOf(HWND hwnd) {
    return reinterpret_cast<Record*>(GetWindowLongPtrW(hwnd, GWLP_USERDATA));
}

inline void SetUserData(HWND hwnd, void* record) {
    SetWindowLongPtrW(hwnd, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(record));
}

}  // namespace kor
