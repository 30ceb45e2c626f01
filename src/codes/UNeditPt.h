#pragma once
// A reduced point, with the name, code and display attributes it takes into the plan and
// the job, and what is attached to it.
//
// A survey has millions of points and few codes, and few points have a name in the job, a
// layer, images, attributes or a note: a point shares its code's text with the other points
// of that code, and keeps those rarer members apart, made when one is first set.

#include <memory>
#include <string>
#include <vector>

#include "platform/geometry/UWPoint.h"
#include "platform/geometry/UWVector.h"

/// An image attached to a point: its file and two numbers of the image record.
struct UAttachedImageFile {
    std::wstring FileName;
    double Number1 = 0.0;
    double Number2 = 0.0;
};

/// An attribute of a point: name, type and value, as text.
struct UAttributeObject {
    std::wstring Name;
    std::wstring Type;
    std::wstring Value;
};

class UNeditPt : public UWPoint {
  public:
    /// Flags: made by a PT record; derived by computation, so its height is not observed.
    static constexpr unsigned kFromPTRecord = 1u;
    static constexpr unsigned kInterpolated = 2u;

    UNeditPt() = default;
    UNeditPt(const UWPoint& point, const std::wstring& id, unsigned flags);
    UNeditPt(const UWVector& vector, const std::wstring& id, unsigned flags);
    UNeditPt(double east, double north, const std::wstring& id, unsigned flags);
    UNeditPt(const std::wstring& id, double east, double north, double height,
             const std::wstring& code, unsigned flags);
    /// The same with a code text that the point shares with others (may be null: no code).
    UNeditPt(const std::wstring& id, double east, double north, double height,
             std::shared_ptr<const std::wstring> code, unsigned flags);
    virtual ~UNeditPt() = default;
    UNeditPt(const UNeditPt& other);
    UNeditPt& operator=(const UNeditPt& other);
    UNeditPt(UNeditPt&&) = default;
    UNeditPt& operator=(UNeditPt&&) = default;

    /// Points are the same point when their names are equal, case-sensitive.
    bool operator==(const UNeditPt& other) const { return ID == other.ID; }
    bool operator!=(const UNeditPt& other) const { return ID != other.ID; }

    const std::wstring& GetID() const { return ID; }
    void SetID(const std::wstring& id) { ID = id; }
    const std::wstring& GetCode() const { return Code ? *Code : Extras::kNone; }
    /// The code's text as the point shares it; null for no code.
    const std::shared_ptr<const std::wstring>& GetSharedCode() const { return Code; }
    const std::wstring& GetNewID() const { return More ? More->NewID : Extras::kNone; }
    void SetNewID(const std::wstring& id) { Extra().NewID = id; }
    int GetColor() const { return Color; }
    void SetColor(int color) { Color = color; }
    int GetMarker() const { return Marker; }
    void SetMarker(int marker) { Marker = marker; }
    const std::wstring& GetLayer() const { return More ? More->Layer : Extras::kNone; }
    void SetLayer(const std::wstring& layer) { Extra().Layer = layer; }
    int GetContourFlag() const { return ContourFlag; }
    void SetContourFlag(int flag) { ContourFlag = flag; }
    int GetPtFlag() const { return PtFlag; }
    void SetPtFlag(int flag) { PtFlag = flag; }
    unsigned GetFlags() const { return Flags; }
    bool IsPTRecord() const { return (Flags & kFromPTRecord) != 0; }
    bool IsPTInterpolated() const { return (Flags & kInterpolated) != 0; }
    const std::wstring& GetNote() const { return More ? More->Note : Extras::kNone; }
    void SetNote(const std::wstring& note) { Extra().Note = note; }

    const std::vector<UAttachedImageFile>& GetImages() const {
        return More ? More->Images : Extras::kNoImages;
    }
    int GetImageSize() const { return static_cast<int>(GetImages().size()); }
    const std::vector<UAttributeObject>& GetPointAttributes() const {
        return More ? More->Attributes : Extras::kNoAttributes;
    }
    int GetPointAttributeSize() const { return static_cast<int>(GetPointAttributes().size()); }
    void SetImage(double number1, double number2, const std::wstring& file);
    /// Appends an attribute; refuses, adding nothing, an empty name.
    bool SetPointAttribute(const std::wstring& name, const std::wstring& type,
                           const std::wstring& value);

  private:
    /// The members few points have.
    struct Extras {
        static const std::wstring kNone;
        static const std::vector<UAttachedImageFile> kNoImages;
        static const std::vector<UAttributeObject> kNoAttributes;
        std::wstring NewID;
        std::wstring Layer;
        std::vector<UAttachedImageFile> Images;
        std::vector<UAttributeObject> Attributes;
        std::wstring Note;
    };
    Extras& Extra();

    std::wstring ID;
    std::shared_ptr<const std::wstring> Code;
    int Color = 15;
    int Marker = 0;
    int ContourFlag = 0;
    int PtFlag = 0;
    unsigned Flags = 0;
    std::unique_ptr<Extras> More;
};
