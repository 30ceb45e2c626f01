#pragma once
// A coordinate record written without a name under a station or back-bearing record takes
// that record's name. Every reader of rows (files, stored documents, downloads) passes its
// rows through one of these, in order.

#include <string>

class UNeutralFileFormat;

class NamelessCoordinates {
  public:
    /// The row as it goes into the list: a coordinate record of at most two commas gets the
    /// ID field of the last station or back-bearing record before it (an empty one before
    /// any), other rows stay as they are.
    std::wstring Complete(const UNeutralFileFormat& format, int type, const std::wstring& row);

  private:
    std::wstring IdText;
};
