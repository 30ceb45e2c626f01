#include "transfer/PointCodeReader.h"

#include "platform/text/WideText.h"

namespace nedit {

PointCodeReader::~PointCodeReader() = default;

std::vector<CodeGroup> PointCodeReader::Parse(const std::wstring& code) const {
    CodeGroup group;
    group.Code = Trim(code);
    return {group};
}

bool PointCodeReader::HasCommand(const CodeGroup& /*group*/,
                                 const std::wstring& /*keyword*/) const {
    return false;
}

}  // namespace nedit
