#pragma once
// Small texts of the exports: a count with its noun for the messages ("1 point", "3 points"),
// and a number written so that it reads back exactly, whatever the user's locale.

#include <cstddef>
#include <string>

#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"

namespace nedit {

inline std::string Counted(std::size_t count, const char* one, const char* many) {
    return std::to_string(count) + " " + (count == 1 ? one : many);
}

inline std::string ExactNumber(double value) {
    return ToUtf8(DoubleToText(value));
}

}  // namespace nedit
