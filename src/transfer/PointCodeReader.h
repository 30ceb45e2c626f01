#pragma once
// How the transfer reads the code field of a point: its groups (a feature code with a string
// number, a comment, commands, contour and flag values and symbol values) and whether a group
// holds a command. This is the part of the job's code grammar that the transfer asks of it.
//
// This class itself reads a code as one group whose feature code is the whole code, trimmed,
// with nothing else stated; an empty code is one empty group. The transfer of a document reads
// codes by the job's grammar (CodeGrammarReader, derived from this class); this plain reading
// serves callers that hand it in on purpose.

#include <string>
#include <vector>

namespace nedit {

/// One group of a code field, as the code grammar parses it.
struct CodeGroup {
    std::wstring StrNo;
    std::wstring Code;
    std::wstring Comment;
    std::wstring Commands;
    /// 1 or 0 when the token states the contour digit.
    int ContourValue = 0;
    bool ContourGiven = false;
    /// The value of the extra point flag, when ExtraFlagGiven.
    int ExtraFlag = 0;
    int ExtraFlagGiven = 0;
    /// The group's symbol values; the first is the symbol's scale.
    double SymbolValues[3] = {1.0, 0.0, 0.0};
};

class PointCodeReader {
  public:
    virtual ~PointCodeReader();

    /// The groups of a code field; none when the field cannot be parsed.
    virtual std::vector<CodeGroup> Parse(const std::wstring& code) const;
    /// The group holds the command `keyword`.
    virtual bool HasCommand(const CodeGroup& group, const std::wstring& keyword) const;
};

}  // namespace nedit
