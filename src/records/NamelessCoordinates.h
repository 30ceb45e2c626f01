#pragma once
// A coordinate record written without a name under a station or back-bearing record takes
// that record's name. Every reader of rows (files, stored documents, downloads) passes its
// rows through one of these, in order.

#include <string>
#include <string_view>

class UNeutralFileFormat;

class NamelessCoordinates {
  public:
    /// The row as it goes into the list: a coordinate record of at most two commas gets the
    /// ID field of the last station or back-bearing record before it (an empty one before
    /// any), other rows stay as they are.
    std::wstring Complete(const UNeutralFileFormat& format, int type, const std::wstring& row);
    /// The same for a row in UTF-8: `row` itself, or the completed row made in `buffer`.
    std::string_view CompleteUtf8(const UNeutralFileFormat& format, int type, std::string_view row,
                                  std::string& buffer);

  private:
    std::wstring IdText;
    std::string IdTextUtf8;  // the same text
};
