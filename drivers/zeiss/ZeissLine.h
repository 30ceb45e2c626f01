#pragma once
// One data line of the Zeiss (Trimble) Elta formats R4, R5 and Rec 500. The three lay out
// the same content: an information block, which is a text (a program such as "OR.COOR" or
// "POLAR", or "INPUT") or a point identification (point number and code), and up to three
// value blocks, each a type identifier, a number and, in R4 and R5, its unit.
//
//   R4       For R4|KR NTR1100|X       21.259 m   |Y       59.620 m   |Z       11.256 m   |
//   R5       For R5|Adr 0008|KR NTR1100|X ...|Y ...|Z ...|
//   Rec 500     0007                 508 0863    X       77.688 Y       -91.484 Z   156.261
//
// In R4 and R5 the information block is a type (KR and PR for a point, TR for a text), a
// blank, a code of three characters and a point number of four. In Rec 500 a text starts in
// column 9; a point number stands right-aligned up to column 27 and its code after it.

#include <string>
#include <string_view>
#include <vector>

struct ZeissBlock {
    std::string identifier;  // "X", "Hz", "th", ...
    std::string value;
    std::string unit;  // empty when the layout gives none
};

class ZeissLine {
  public:
    /// Reads a line of any of the three layouts; false when it is none of them.
    bool Read(std::string_view line);

    bool IsText() const { return text_; }
    /// The text of a text line ("OR.COOR"), or the point number of a point line.
    const std::string& Name() const { return name_; }
    const std::string& Code() const { return code_; }
    const std::vector<ZeissBlock>& Blocks() const { return blocks_; }

  private:
    bool ReadBarred(std::string_view line, std::size_t first_block);
    bool ReadRec500(std::string_view line);

    bool text_ = false;
    std::string name_;
    std::string code_;
    std::vector<ZeissBlock> blocks_;
};
