#include "traverse/NameList.h"

namespace nedit {

std::wstring RouteText(const NameList& route) {
    std::wstring text;
    for (const NameEntry& entry : route) text += entry.Key + L',';
    return text;
}

}  // namespace nedit
