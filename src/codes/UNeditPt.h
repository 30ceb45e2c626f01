#pragma once
// A reduced point, with the name, code and display attributes it takes into the plan and
// the job, and what is attached to it.

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
    virtual ~UNeditPt() = default;
    UNeditPt(const UNeditPt&) = default;
    UNeditPt& operator=(const UNeditPt&) = default;
    UNeditPt(UNeditPt&&) = default;
    UNeditPt& operator=(UNeditPt&&) = default;

    /// Points are the same point when their names are equal, case-sensitive.
    bool operator==(const UNeditPt& other) const { return ID == other.ID; }
    bool operator!=(const UNeditPt& other) const { return ID != other.ID; }

    const std::wstring& GetID() const { return ID; }
    void SetID(const std::wstring& id) { ID = id; }
    const std::wstring& GetCode() const { return Code; }
    const std::wstring& GetNewID() const { return NewID; }
    void SetNewID(const std::wstring& id) { NewID = id; }
    int GetColor() const { return Color; }
    void SetColor(int color) { Color = color; }
    int GetMarker() const { return Marker; }
    void SetMarker(int marker) { Marker = marker; }
    const std::wstring& GetLayer() const { return Layer; }
    void SetLayer(const std::wstring& layer) { Layer = layer; }
    int GetContourFlag() const { return ContourFlag; }
    void SetContourFlag(int flag) { ContourFlag = flag; }
    int GetPtFlag() const { return PtFlag; }
    void SetPtFlag(int flag) { PtFlag = flag; }
    unsigned GetFlags() const { return Flags; }
    bool IsPTRecord() const { return (Flags & kFromPTRecord) != 0; }
    bool IsPTInterpolated() const { return (Flags & kInterpolated) != 0; }
    const std::wstring& GetNote() const { return Note; }
    void SetNote(const std::wstring& note) { Note = note; }

    const std::vector<UAttachedImageFile>& GetImages() const { return Images; }
    int GetImageSize() const { return static_cast<int>(Images.size()); }
    const std::vector<UAttributeObject>& GetPointAttributes() const { return Attributes; }
    int GetPointAttributeSize() const { return static_cast<int>(Attributes.size()); }
    void SetImage(double number1, double number2, const std::wstring& file);
    /// Appends an attribute; refuses, adding nothing, an empty name.
    bool SetPointAttribute(const std::wstring& name, const std::wstring& type,
                           const std::wstring& value);

  private:
    std::wstring ID;
    std::wstring Code;
    std::wstring NewID;
    int Color = 15;
    int Marker = 0;
    std::wstring Layer;
    int ContourFlag = 0;
    int PtFlag = 0;
    unsigned Flags = 0;
    std::vector<UAttachedImageFile> Images;
    std::vector<UAttributeObject> Attributes;
    std::wstring Note;
};
