#pragma once
// Sends the chosen points of a job through the loaded driver of a device manager: to the
// open port, or into the bytes of a file that the caller writes. Progress goes to a sink,
// which may stop the upload between two points.
//
// Decisions:
// - A point the driver's format cannot hold is left out and the upload goes on; the driver's
//   message names it, and the outcome counts it.
// - A link that fails ends the upload; what had gone out stays counted as sent.
// - Coordinates go in the job's length unit; the driver converts where its format wants.

#include <string>
#include <vector>

#include "instruments/UploadSelection.h"
#include "platform/units/Units.h"

class UDeviceManager;

namespace nedit {

class ProgressSink;

struct UploadOutcome {
    int sent = 0;
    int refused = 0;                     // left out: the format cannot hold them
    bool failed = false;                 // the driver did not start, or the link failed
    bool aborted = false;                // the user stopped it
    std::vector<std::wstring> messages;  // the driver's and the link's, for the user
};

class PointUpload {
  public:
    /// Coordinates are in `unit`, the job's length unit.
    PointUpload(UDeviceManager& manager, LengthUnit unit);

    /// Sends `points` to the open port, or into `*file` when given.
    UploadOutcome Run(const std::vector<UploadPoint>& points, std::string* file,
                      ProgressSink* progress);

  private:
    UDeviceManager& manager_;
    unsigned mode_;
};

}  // namespace nedit
