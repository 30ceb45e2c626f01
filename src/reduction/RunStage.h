#pragma once
// A stage that a room above the engine adds to its runs: route discovery (traverse), the
// attachments of points (images, attributes, notes), and whatever later rooms hang on a run.
// Such rooms stand above the observation model and the walk, so the engine cannot call them;
// whoever builds the engine (the document) hands their stages in, and the engine calls them at
// their place in the run. A run without a stage stands without it, as it does without a report.
//
// The commands that follow a run (the traverse adjustment, the transfer to the job) need no
// stage: they are called from above and call down into the engine.

class UNeditDatabase;

namespace nedit {

/// The places in a run where stages are called, in the order of the run.
enum class RunStep {
    /// After a walk that reached its end, and the extents: in Process, in Regenerate, and in
    /// Generate when routes are asked for. Route discovery comes here.
    Routes,
    /// Last in a full run (Process only): images, attributes and notes go onto the points.
    Attachments,
};

class RunStage {
  public:
    virtual ~RunStage() = default;
    /// Called at every step a run reaches, in the run's order, with the engine as the walk
    /// left it. A stage acts at the steps it serves and passes over the others.
    virtual void Run(UNeditDatabase& engine, RunStep step) = 0;
};

}  // namespace nedit
