#pragma once

class QAbstractItemView;

namespace Platform {

/// An arrow key selects the row that has the focus where none is selected, as
/// when Tab has just come to the list. The only row could not be reached otherwise.
void SelectByArrowKeys(QAbstractItemView* list);

}  // namespace Platform
