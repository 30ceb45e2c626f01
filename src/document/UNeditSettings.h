#pragma once
// The display settings of a raw-data document's plan, kept in its "Settings" stream: seven
// numbered values, each with the kind it is stored as.

#include <array>
#include <string>

class UNeditSettings {
  public:
    /// Dictionary ids of the values.
    enum Id {
        ShowPoints = 1,
        ShowLines,
        ShowSymbols,
        ShowLineStyles,
        ShowPointNumbers,
        ShowPointCodes,
        TextSize
    };

    int Get(Id id) const { return Values[static_cast<std::size_t>(id - 1)]; }
    void Set(Id id, int value) { Values[static_cast<std::size_t>(id - 1)] = value; }

    /// The stored form: one line "id,kind,value" per value.
    std::string Write() const;
    /// Reads the stored form; values it does not name keep their defaults. False for text
    /// that is not of that form, with nothing changed.
    bool Read(const std::string& text);

  private:
    // Show points and lines; no symbols, line styles, numbers or codes; normal text.
    std::array<int, 7> Values{1, 1, 0, 0, 0, 0, 0};
};
