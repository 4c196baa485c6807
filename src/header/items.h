// The items of a strip: what the HCM_ messages do.
#pragma once

#include <korcontrols/header.h>

#include "header/record.h"

namespace kor {

// Results are those of the messages; see <korcontrols/header.h>.
LRESULT InsertItem(HeaderRecord& header, int index, const HeaderItemDesc* item);
LRESULT DeleteItem(HeaderRecord& header, int index);
LRESULT SetItem(HeaderRecord& header, int index, const HeaderItemDesc* item);
LRESULT SetItemState(HeaderRecord& header, int index, uint32_t state);
LRESULT GetItem(const HeaderRecord& header, int index, HeaderItemDesc* item);
LRESULT GetItemSize(const HeaderRecord& header, int index);

}  // namespace kor
