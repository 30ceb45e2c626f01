#include "transfer/LockedLayersQuestion.h"

#include <utility>

#include "platform/messages/Translate.h"

namespace nedit {

LockedLayersQuestion::LockedLayersQuestion(std::vector<std::wstring> layers)
    : Layers(std::move(layers)) {
    std::wstring names;
    for (std::size_t i = 0; i < Layers.size(); ++i) {
        names += L"<" + Layers[i] + L">";
        if (i != 0 && i % 5 == 0) names += L"\n";
    }
    names += L"\n";
    Message = Translate(
        L"{1}\" are Locked !!!\n These layers needs to be Unlocked to transfer to Job.\n "
        L"Unlocked these layers ?\";{2}",
        {names, L"\n"});
}

}  // namespace nedit
