#include "transfer/CodeGrammarReader.h"

#include "platform/text/WideText.h"

namespace nedit {

std::vector<CodeGroup> CodeGrammarReader::Parse(const std::wstring& code) const {
    std::vector<USvyCodeExt> parsed;
    Ctrl.ParseString(code, parsed);
    std::vector<CodeGroup> groups;
    for (const USvyCodeExt& ext : parsed) {
        CodeGroup group;
        group.StrNo = ext.StrNo;
        group.Code = ext.Code;
        group.Comment = ext.Comment;
        group.Commands = ext.Commands;
        group.ContourValue = ext.ContourValue;
        group.ContourGiven = ext.ContourGiven;
        groups.push_back(std::move(group));
    }
    // An empty field is one empty group, as it always was for the transfer.
    if (groups.empty()) groups.emplace_back();
    return groups;
}

bool CodeGrammarReader::HasCommand(const CodeGroup& group, const std::wstring& keyword) const {
    if (keyword.empty()) return false;
    for (const std::wstring& token : Ctrl.SplitCode(group.Commands, 1)) {
        std::wstring value;
        if (EqualsIgnoreCase(Ctrl.InterpretCommand(token, value), keyword)) return true;
    }
    return false;
}

}  // namespace nedit
