#pragma once
// Interactive inputs of the plan (picking points, dragging) stack up on the document; the
// command table below their owner hands them the commands that end them.

/// One interactive input.
class XInput {
  public:
    virtual ~XInput() = default;
    /// Ends the input with the command that ended it.
    virtual void Terminate(int command) = 0;
    /// True when something else owns the input, so the document must not delete it.
    virtual bool IsOwnedElsewhere() const { return false; }
};

/// A pending option of the input framework; the document owns it once it is set.
class XInputOption {
  public:
    virtual ~XInputOption() = default;
};

/// The commands of the input framework that the document carries out (UNeditDoc::OnCmdMsg),
/// with the ids the suite has always sent. The "extra" argument carries the value in or out.
namespace nedit::input {
constexpr unsigned kAbortModalOption = 32776;
constexpr unsigned kSetOptionValueA = 32777;  // extra: int* in
constexpr unsigned kGetOptionValueA = 32778;  // extra: int* out
constexpr unsigned kSetOptionValueB = 32779;
constexpr unsigned kGetOptionValueB = 32780;
constexpr unsigned kGetOptionIdsB = 32781;  // extra: std::vector<unsigned>** out
constexpr unsigned kGetOptionIdsA = 32782;
constexpr unsigned kPushInput = 32968;  // extra: the XInput*
constexpr unsigned kPopInput = 32969;   // extra: XInput** out
constexpr unsigned kTopInput = 32970;
constexpr unsigned kGetOption = 32972;  // extra: XInputOption** out
constexpr unsigned kRemoveOption = 32973;
constexpr unsigned kGetInputStack = 32977;  // extra: std::vector<XInput*>** out

/// The commands of the plan that end the input on top of the stack; the input is told the
/// command that ended it.
inline bool EndsInput(unsigned id) {
    constexpr unsigned kFirstOfRun = 33572;
    constexpr unsigned kLastOfRun = 33582;
    constexpr unsigned kOthers[] = {32766, 33584, 33585, 33589, 33592, 33593};
    if (id >= kFirstOfRun && id <= kLastOfRun) return true;
    for (const unsigned other : kOthers) {
        if (id == other) return true;
    }
    return false;
}
}  // namespace nedit::input
