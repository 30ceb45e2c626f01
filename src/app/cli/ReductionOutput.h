#pragma once
// What a reduction gives, as the command line prints it.

#include <string>
#include <vector>

#include "PointOutput.h"

class UNeditDatabase;
class UNeditReport;

/// The reduced points of a run, in the order of the point store.
std::vector<PointRow> ReducedPoints(const UNeditDatabase& engine);
/// One JSON object: points, lines, arcs, circles, the engine's error code and the messages.
void PrintJson(const UNeditDatabase& engine, const std::vector<std::wstring>& messages);

/// Throws CLI::ValidationError when the JSON and the report would both go to standard output.
void CheckOutputOptions(const std::string& reportPath, bool json);

/// Writes what a reduction gives: the report to `reportPath` ("-" for standard output, empty
/// for none), then the JSON, or the table of points unless the report took standard output.
/// False, with a message, when the report file cannot be written.
bool WriteReductionOutput(const UNeditDatabase& engine, const UNeditReport* report,
                          const std::string& reportPath, bool json,
                          const std::vector<std::wstring>& messages, int decimals);
