// Window records: allocation and lifetime.
#pragma once

#include "base/assert.h"
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

// The lifetime of a record. The record of every control that has one per window holds this as
// `life`.
struct RecordLife {
    uint32_t uses;  // nested procedures that are using the record now
    bool retired;   // its window has been destroyed
};

// One procedure's use of a record, which may be null. Nearly every system call that a procedure
// makes sends messages, and a host may destroy the window inside any of them, while the procedure
// still needs its record. So FreeRecord(Record*) frees a retired record when its outermost use
// ends. A window procedure begins with a use as soon as its window has a record.
template <typename Record>
class RecordUse {
public:
    explicit RecordUse(Record* record) noexcept : record_(record) {
        if (record_) ++record_->life.uses;
    }
    ~RecordUse() {
        if (!record_) return;
        KOR_ASSERT(record_->life.uses > 0);
        if (--record_->life.uses == 0 && record_->life.retired) FreeRecord(record_);
    }
    RecordUse(const RecordUse&) = delete;
    RecordUse& operator=(const RecordUse&) = delete;

private:
    Record* record_;
};

// WM_DESTROY: the window no longer leads to its record. The record is freed with its last use.
template <typename Record>
void RetireRecord(Record& record) {
    KOR_ASSERT(record.life.uses > 0 && !record.life.retired);
    record.life.retired = true;
}

}  // namespace kor
