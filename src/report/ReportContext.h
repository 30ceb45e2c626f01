#pragma once
// What the reduction report reads of the document it reports on. The raw-data document
// implements it; the report knows nothing else of the document, and a report without a
// context prints in its own last units with the reduced set of columns.
//
// One place for each setting: the output units and the columns are the report parameters
// here. The report takes its output units from them when it starts a head (Init,
// UpdateSettings, PrintMainReportHead, PrintTravHead) and reads them from that copy alone
// until the next head, so that every value of one block is written in the same unit.

#include "report/OutParamStruct.h"

class UJobSettings;
class UNeutralFileFormat;

namespace nedit {

class ReportContext {
  public:
    virtual ~ReportContext() = default;

    /// The report parameters: output angle and length units, column flags.
    virtual const OutParamStruct& GetOutputParameters() const = 0;
    /// Easting before Northing in every column and line.
    virtual bool IsENOrder() const = 0;
    /// The job's settings, as they are now: its length unit, foot format and angle format.
    virtual const UJobSettings& GetSettings() const = 0;
    /// The record service of the file reported on: its units and angle modes for the head,
    /// and the reading of vertical angles in its vertical mode.
    virtual const UNeutralFileFormat& GetRecordFormat() const = 0;
};

}  // namespace nedit
