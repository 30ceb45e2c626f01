#pragma once
// Translation of the system's English texts. Every message shown to the user goes through
// Translate: a catalogue entry replaces the English text when one exists, then "{1}", "{2}", …
// are filled with the arguments.

#include <initializer_list>
#include <map>
#include <string>

namespace nedit {

/// English text to translated text. Empty by default, so English stands.
class TranslationCatalogue {
  public:
    static TranslationCatalogue& Instance();

    void Set(const std::wstring& english, const std::wstring& translated);
    void Clear();
    /// The translation of `english`, or `english` itself when there is none.
    const std::wstring& Lookup(const std::wstring& english) const;

  private:
    std::map<std::wstring, std::wstring> entries_;
};

/// Replaces "{1}" by the first argument, "{2}" by the second, and so on. A placeholder
/// without an argument is left as it stands, so a missing value shows in the message.
std::wstring FillPlaceholders(const std::wstring& text, std::initializer_list<std::wstring> args);

/// The translated text with its placeholders filled.
std::wstring Translate(const std::wstring& english, std::initializer_list<std::wstring> args = {});

}  // namespace nedit
