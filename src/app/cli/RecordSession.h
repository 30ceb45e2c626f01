#pragma once
// What every command that reads records needs: job settings, the format service with the
// record definition loaded, a record list, a dialog host and an engine, wired together.

#include <memory>
#include <string>

#include "ConsoleDialogHost.h"
#include "document/UListCtrl.h"
#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"

class USurveyDoc;

struct RecordSession {
    /// Loads the record definition; false, with a message on standard error, when it fails.
    bool LoadDefinition();
    /// Builds the engine, on the job when one is given.
    UNeditDatabase& StartEngine(USurveyDoc* job = nullptr);

    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    UListCtrl list{&format};
    ConsoleDialogHost host;
    std::unique_ptr<UNeditDatabase> engine;
};

/// The directory holding the record definition: $SXNEDIT_DATA_DIR, else the build's data/.
std::string DataDirectory();
