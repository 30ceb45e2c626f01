#pragma once
// A polyline of the job: a name (not unique: a string may be kept twice), a look, a flags
// word and an ordered list of vertices. Each vertex names a point of the job; its bulge
// belongs to the segment that leaves it (0 is straight), and the last vertex's bulge is 0.
// The vertex rows are the polyline's linkage to its points: a point that a polyline uses
// cannot be deleted, and Save rewrites the vertices with the polyline in one transaction.

#include <string>
#include <vector>

#include "platform/job/UDBLinework.h"

struct UVertex {
    double Bulge = 0.0;
    long PointId = 0;
};

class UDBPolyLine : public UDBLinework {
  public:
    explicit UDBPolyLine(USurveyDoc* job, long id = 0);

    bool Load(long id) override;
    /// False (LastError) with fewer than 2 vertices, a vertex that is no point of the job, or
    /// a locked stored polyline.
    bool Save(int undoFlag = 0, bool redraw = false, bool select = false) override;

    void Add(const UVertex& vertex) { vertices_.push_back(vertex); }
    /// Inserts before `index`; an index at or past the end appends.
    void AddVertexAt(int index, const UVertex& vertex);
    /// False for an index out of range.
    bool SetAt(int index, const UVertex& vertex);
    /// The point of vertex `index`; 0 out of range.
    long GetIdAt(int index) const;
    const UVertex& GetAt(int index) const { return vertices_.at(static_cast<std::size_t>(index)); }
    int GetCount() const { return static_cast<int>(vertices_.size()); }
    void RemoveAll() { vertices_.clear(); }
    const std::vector<UVertex>& GetVertices() const { return vertices_; }

    const std::wstring& GetName() const { return name_; }
    void SetName(const std::wstring& name) { name_ = name; }

    /// Detaching and re-attaching a polyline to its points, for callers that replace one
    /// polyline by another: Save already rewrites the vertex rows in one transaction, so
    /// these only say whether the polyline is saved.
    bool ReleaseLinkage() const { return id_ != 0; }
    bool AddLinkage() const { return id_ != 0; }

  protected:
    const char* AreaQuery() const override;

  private:
    std::wstring name_;
    std::vector<UVertex> vertices_;
};
