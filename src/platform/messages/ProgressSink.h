#pragma once
// Long operations report progress and poll for an abort through a sink they are given.
// The desktop pumps its events in Update; the command line may print or stay silent.

#include <string>

namespace nedit {

class ProgressSink {
  public:
    virtual ~ProgressSink() = default;
    /// `percent` from 0 to 100, with the text of the stage ("Generating Graphics").
    virtual void Update(int /*percent*/, const std::wstring& /*text*/) {}

    bool AbortRequested() const { return abort_requested_; }
    void RequestAbort() { abort_requested_ = true; }
    void ClearAbort() { abort_requested_ = false; }

  private:
    bool abort_requested_ = false;
};

}  // namespace nedit
