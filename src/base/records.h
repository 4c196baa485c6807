// Records of windows: where they come from, and when they go.
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

// Where a record is in its life. The record of every control that has one per window holds this as
// `life`.
struct RecordLife {
    uint32_t uses;  // procedures that work with the record at this moment, one inside another
    bool retired;   // its window has gone
};

// One procedure's work with a record, which may be null. Nearly every call of a procedure to the
// system sends messages, and a host may destroy the window inside any of them; the procedure that
// is under way goes on with its record. So a record that was retired is freed, by
// FreeRecord(Record*), when the outermost use of it ends. Every window procedure begins with a use,
// WM_CREATE's included.
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

// WM_DESTROY: nothing leads from the window to its record any more. It goes with its last use.
template <typename Record>
void RetireRecord(Record& record) {
    KOR_ASSERT(record.life.uses > 0 && !record.life.retired);
    record.life.retired = true;
}

}  // namespace kor
