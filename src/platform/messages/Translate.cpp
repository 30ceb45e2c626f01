#include "platform/messages/Translate.h"

namespace nedit {

TranslationCatalogue& TranslationCatalogue::Instance() {
    static TranslationCatalogue catalogue;
    return catalogue;
}

void TranslationCatalogue::Set(const std::wstring& english, const std::wstring& translated) {
    entries_[english] = translated;
}

void TranslationCatalogue::Clear() {
    entries_.clear();
}

const std::wstring& TranslationCatalogue::Lookup(const std::wstring& english) const {
    const auto found = entries_.find(english);
    return found == entries_.end() ? english : found->second;
}

std::wstring FillPlaceholders(const std::wstring& text, std::initializer_list<std::wstring> args) {
    std::wstring out;
    out.reserve(text.size());
    std::size_t i = 0;
    while (i < text.size()) {
        // A placeholder is "{" digits "}" naming an argument that exists.
        if (text[i] == L'{') {
            std::size_t j = i + 1;
            std::size_t index = 0;
            while (j < text.size() && text[j] >= L'0' && text[j] <= L'9' && j - i < 6) {
                index = index * 10 + static_cast<std::size_t>(text[j] - L'0');
                ++j;
            }
            if (j > i + 1 && j < text.size() && text[j] == L'}' && index >= 1 &&
                index <= args.size()) {
                out += *(args.begin() + (index - 1));
                i = j + 1;
                continue;
            }
        }
        out += text[i++];
    }
    return out;
}

std::wstring Translate(const std::wstring& english, std::initializer_list<std::wstring> args) {
    return FillPlaceholders(TranslationCatalogue::Instance().Lookup(english), args);
}

}  // namespace nedit
