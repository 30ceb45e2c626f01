#pragma once
// Shows the message of an engine error code.

#include <string>

namespace nedit {
class DialogHost;
}

class CError {
  public:
    /// The message of a code; empty for 0 and for -11 (the user cancelled), which show none.
    static std::wstring MessageOf(int code);
    /// Shows the code's message, translated, with the error icon, when it has one.
    /// Gives the code back.
    static int Show(int code, nedit::DialogHost* host);
};
