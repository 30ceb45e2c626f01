#pragma once
// Cuts a stream of GSI bytes into blocks of words. A block ends at a line end (CR, LF or
// CR LF) or where a word of index 11 (point number) or 41 (code) begins another block, so
// files that run their blocks together on one line are read as well.
//
// Decisions:
// - A token that is no GSI word spoils its block: the block is handed on whole as
//   unreadable text, so that no observation enters with a value missing.
// - A token or block of unreasonable length (noise, a binary file) is kept only in part;
//   the text handed on says that more followed.
// - Data with no GSI word at all in their first 4096 bytes, or none before they end, are
//   not GSI: nothing of them is handed on as blocks, and the handler hears it once.
// - ETX, EOT or SUB at the start of a line ends the transfer; inside a line it is noise that
//   spoils its block. XON and XOFF are dropped.

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "GsiWord.h"

class GsiBlockReader {
  public:
    class Handler {
      public:
        virtual ~Handler() = default;
        /// A block whose words all read; `text` is the block as it stood, `line` its line.
        virtual void OnBlock(const std::vector<GsiWord>& words, std::string_view text,
                             long line) = 0;
        /// A block with a token that is no GSI word.
        virtual void OnUnreadable(std::string_view text, long line) = 0;
        /// The data are not GSI; nothing more comes.
        virtual void OnNotGsi() = 0;
    };

    static constexpr std::size_t kProbeBytes = 4096;

    explicit GsiBlockReader(Handler& handler) : handler_(handler) {}

    /// Reads the bytes; false once the data have ended the transfer or proved not to be GSI.
    bool Feed(const unsigned char* bytes, std::size_t size);
    /// The end of the data: the last block goes out.
    void Finish();

  private:
    void EndToken();
    void EndBlock();
    void NotGsi();

    Handler& handler_;
    std::string token_;           // the start of the current token
    std::size_t token_size_ = 0;  // its whole length
    std::vector<GsiWord> words_;
    std::string text_;  // the block as it stood, in part when very long
    bool spoilt_ = false;
    long block_line_ = 1;
    long line_ = 1;
    bool last_cr_ = false;
    bool ended_ = false;
    bool gsi_ = false;  // a GSI word has been read
    std::size_t bytes_ = 0;
    // Unreadable blocks before the first word: they go out once the data prove to be GSI.
    std::vector<std::pair<std::string, long>> held_;
};
