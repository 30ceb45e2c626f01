#pragma once
// "Selection Screen Entry" (dialog 8003): what goes to an instrument, before an upload. The
// dialog only collects the choice: where the points come from, and by which ranges they and
// their layers are chosen. Its caller makes it, shows it and reads the getters;
// UploadSelection::FromDialog applies the choice to the points of a job.
//
// The range getters put each pair in order first, in the dialog as well: texts compare case
// by case as texts (so the point 9 comes after 10000), heights as numbers.

#include <string>
#include <vector>

#include "platform/messages/DialogHost.h"

/// What the dialog needs of the view's document: its layers, by name, in order.
class ULayerSource {
  public:
    virtual ~ULayerSource() = default;
    /// The names; an empty name ends the list.
    virtual std::vector<std::wstring> GetLayerList() const = 0;
};

class UUploadSource : public nedit::UDialogLogic {
  public:
    static constexpr int kResourceId = 8003;
    // Radio values: the id of the chosen button.
    static constexpr int kDatabase = 1115;
    static constexpr int kFile = 1116;
    static constexpr int kAllLayers = 1142;
    static constexpr int kLayersOn = 1128;
    static constexpr int kLayersOff = 1141;
    static constexpr int kLayerFromList = 1127;
    static constexpr int kLayerToList = 1138;

    /// `document` gives the layers; may be null, and the layer lists then stay empty.
    UUploadSource(nedit::DialogHost* parent, const ULayerSource* document);

    std::wstring DialogName() const override { return L"Selection Screen Entry"; }
    /// Fills both layer lists.
    void OnInitDialog() override;
    /// Shows the dialog through the host. Hosts show dialogs modally, so this waits for it to
    /// end, unlike the window it once made; 1 when it ended with OK.
    int Create_Dlg();

    int GetSource() const { return Source; }
    int GetAllLayer() const { return AllLayer; }
    int GetByPtno(std::wstring& from, std::wstring& to);
    int GetByLayer(std::wstring& from, std::wstring& to);
    int GetByCode(std::wstring& from, std::wstring& to);
    int GetByHeight(double& from, double& to);
    int GetByWindow() const { return ByWindow; }
    int GetByScreen() const { return ByScreen; }
    /// Fills list `id` (kLayerFromList or kLayerToList) with the document's layers.
    void AddComboLayer(int id);
    /// The items of a layer list.
    const std::vector<std::wstring>& GetLayerItems(int id) const;

    int Source = kDatabase;
    int AllLayer = kAllLayers;
    int ByPtRange = 0;
    int ByLayer = 0;
    int ByCode = 0;
    int ByHeight = 0;
    int ByWindow = 0;
    int ByScreen = 0;
    std::wstring PointFrom = L"1";
    std::wstring PointTo = L"10000";
    std::wstring LayerFrom;
    std::wstring LayerTo;
    std::wstring CodeFrom;
    std::wstring CodeTo;
    double HeightFrom = -100.0;
    double HeightTo = 10000.0;

  private:
    nedit::DialogHost* Parent;
    const ULayerSource* Document;
    std::vector<std::wstring> LayersFrom;
    std::vector<std::wstring> LayersTo;
};
