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
