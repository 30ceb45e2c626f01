// The record list on paper: pages of a fixed number of rows, each under its page number.

#include <algorithm>

#include "document/UListCtrl.h"
#include "platform/text/Format.h"

namespace nedit {

std::vector<std::wstring> ListPage::Lines() const {
    if (heading.empty()) return {};
    std::vector<std::wstring> lines(static_cast<std::size_t>(kFirstRowLine));
    lines.front() = heading;
    lines.insert(lines.end(), rows.begin(), rows.end());
    return lines;
}

}  // namespace nedit

int UListCtrl::OnPreparePrinting(int pageSize) const {
    if (pageSize <= 0) return 1;
    const int count = GetItemCount();
    const int pages = count / pageSize + (count % pageSize != 0 ? 1 : 0);
    return std::max(pages, 1);
}

nedit::ListPage UListCtrl::PrintPage(int page, int pageSize) const {
    nedit::ListPage printed;
    const int pages = OnPreparePrinting(pageSize);
    if (page < 1 || page > pages) return printed;
    const int count = GetItemCount();
    const int first = pageSize <= 0 ? 0 : (page - 1) * pageSize;
    const int last = pageSize <= 0 ? count : std::min(first + pageSize, count);
    printed.heading = nedit::Format(L"Page %d of %d", page, pages);
    printed.firstRow = first;
    for (int row = first; row < last; ++row) printed.rows.push_back(GetItemText(row));
    return printed;
}
