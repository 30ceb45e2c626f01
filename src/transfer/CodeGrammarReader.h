#pragma once
// The transfer's reading of point codes by the job's code grammar: the groups of a code
// field, each with its feature code, string number, comment and commands, as reduction reads
// them (USvyCodeCtrl). The transfer uses it unless it is handed another reader.

#include <string>
#include <vector>

#include "codes/USvyCodeCtrl.h"
#include "transfer/PointCodeReader.h"

namespace nedit {

class CodeGrammarReader : public PointCodeReader {
  public:
    explicit CodeGrammarReader(const CodeSettings& settings) : Ctrl(settings) {}

    std::vector<CodeGroup> Parse(const std::wstring& code) const override;
    bool HasCommand(const CodeGroup& group, const std::wstring& keyword) const override;

  private:
    USvyCodeCtrl Ctrl;
};

}  // namespace nedit
