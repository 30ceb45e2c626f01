#pragma once
// Which points of a job go to an instrument: the choice of the "Selection Screen Entry"
// dialog (UUploadSource), or of the command line, applied to the job's points.
//
// A point is chosen when it passes every criterion that is set:
// - the layer state: all layers, only those switched on, or only those switched off (a point
//   without a layer counts as on a layer that is on);
// - the point range: names compare as whole numbers when the name and both ends are whole
//   numbers (so 9 lies between 1 and 10000, as a surveyor means it), else as texts;
// - the layer and code ranges, and the lists of layers and codes: texts without regard to
//   case, as the job looks codes up; a code compares by its first word, the feature code;
// - the height range: a point without height lies outside every height range.
// Ends of a range are put in order first; both ends belong to the range.
//
// Decisions: "By Window" and "On Screen" need the plan the dialog was opened over, which
// this object has not; a caller with a plan narrows the points itself. Points come in the
// order the job took them in.

#include <optional>
#include <string>
#include <utility>
#include <vector>

class USurveyDoc;
class UUploadSource;

namespace nedit {

/// A point of the job as it goes to an instrument; lengths in the job's unit.
struct UploadPoint {
    std::wstring name;
    std::wstring code;
    std::wstring layer;
    double east = 0.0;
    double north = 0.0;
    double height = 0.0;
    bool hasHeight = false;
    bool layerOn = true;
};

class UploadSelection {
  public:
    enum class Layers { All, On, Off };
    using TextRange = std::pair<std::wstring, std::wstring>;

    /// The criteria the dialog's values set.
    static UploadSelection FromDialog(UUploadSource& dialog);

    void SetLayers(Layers layers) { layers_ = layers; }
    void SetPointRange(const std::wstring& from, const std::wstring& to);
    void SetLayerRange(const std::wstring& from, const std::wstring& to);
    void SetCodeRange(const std::wstring& from, const std::wstring& to);
    void SetHeightRange(double from, double to);
    void SetLayerNames(std::vector<std::wstring> names) { layerNames_ = std::move(names); }
    void SetCodeNames(std::vector<std::wstring> names) { codeNames_ = std::move(names); }

    bool Accepts(const UploadPoint& point) const;
    /// The job's points that pass, in the job's order. Throws nedit::JobError as reading the
    /// job does.
    std::vector<UploadPoint> Select(USurveyDoc& job) const;

  private:
    Layers layers_ = Layers::All;
    std::optional<TextRange> points_;
    std::optional<TextRange> layerRange_;
    std::optional<TextRange> codeRange_;
    std::optional<std::pair<double, double>> heights_;
    std::vector<std::wstring> layerNames_;
    std::vector<std::wstring> codeNames_;
};

}  // namespace nedit
