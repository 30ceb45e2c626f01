#pragma once
// What every drawable object of the job has: an identifier whose top six bits give its kind,
// a layer, a colour and a flags word; attributes, attached images and extended data hung on
// it; and the walk over the objects of its kind (Enumerate, Next).
//
// Decisions:
// - Save gives false for what a caller can meet in normal work: a locked object (its stored
//   flags hold kLocked), a point name taken, a reference to a point or layer that does not
//   exist, a value the schema refuses. LastError says which. A failure of the database
//   itself (disk full, busy past the timeout, read-only job) throws nedit::JobError.
// - The undo flag and the two booleans of Save are accepted for the suite's callers; this
//   database keeps no undo history.
// - Lock and UnLock write the lock at once when the object is saved, so the sequence
//   UnLock, Save, Lock on a locked object works.
// - A layer of 0 means "no layer".

#include <functional>
#include <string>
#include <vector>

class USurveyDoc;
class UWRect;

namespace nedit {
class JobDatabase;

/// An attribute as the job stores it.
struct AttributeRow {
    std::wstring Name;
    std::wstring Type;
    std::wstring Value;
};

/// An attached image: the file and the two numbers of its record.
struct ImageRow {
    std::wstring FileName;
    double Number1 = 0.0;
    double Number2 = 0.0;
};
}  // namespace nedit

class UDBObject {
  public:
    static constexpr unsigned kUseInSurface = 0x10;
    static constexpr unsigned kLocked = 0x10000000;
    /// Extended data kind of a point note.
    static constexpr int kNoteData = 2;

    virtual ~UDBObject();
    UDBObject(const UDBObject&) = default;
    UDBObject& operator=(const UDBObject&) = default;

    /// Reads the object; false, leaving this object as it was, when there is no such object
    /// of this kind.
    virtual bool Load(long id) = 0;
    /// Writes the object: a new one (identifier 0) gets its identifier, an existing one is
    /// updated. See the decisions above for false.
    virtual bool Save(int undoFlag = 0, bool redraw = false, bool select = false) = 0;

    long GetId() const { return id_; }
    /// Gives the object another identifier, as when a new object takes the place of an old
    /// one of its kind; Save then updates that one.
    void SetId(long id) { id_ = id; }
    int GetKind() const { return kind_; }
    USurveyDoc* GetSurveyDoc() const { return job_; }

    long GetLayer() const { return layer_; }
    void SetLayer(long layer) { layer_ = layer; }
    int GetColour() const { return colour_; }
    void SetColour(int colour) { colour_ = colour; }
    unsigned GetFlags() const { return flags_; }
    void SetFlags(unsigned flags) { flags_ = flags; }
    bool IsLocked() const { return (flags_ & kLocked) != 0; }
    /// Sets or clears kLocked, and stores it at once for a saved object. False when the
    /// object is saved but no longer in the job.
    bool Lock();
    bool UnLock();

    /// Adds attributes to the saved object; with `replace` its old attributes go first. Any
    /// type with the members Name, Type and Value will do. The two last booleans are
    /// accepted for the suite's callers. False when the object is not saved or a name is
    /// empty; nothing is then added.
    template <class Attribute>
    bool AddAttributeObjectData(const std::vector<Attribute>& attributes, bool replace,
                                bool /*createTypes*/ = true, bool /*quiet*/ = true) {
        std::vector<nedit::AttributeRow> rows;
        for (const Attribute& a : attributes) rows.push_back({a.Name, a.Type, a.Value});
        return AddAttributes(rows, replace);
    }
    bool AddAttributes(const std::vector<nedit::AttributeRow>& attributes, bool replace);
    std::vector<nedit::AttributeRow> GetAttributes() const;

    /// Attaches image files to the saved object: the job keeps each file's name, made absolute
    /// against `folder` when it is relative and a folder is given. Any type with the members
    /// FileName, Number1 and Number2 will do. False, attaching none, when the object is not
    /// saved or a file does not exist.
    template <class Image>
    bool AttachImageFiles(const std::vector<Image>& images, bool replace,
                          const std::wstring& folder) {
        std::vector<nedit::ImageRow> rows;
        for (const Image& i : images) rows.push_back({i.FileName, i.Number1, i.Number2});
        return AttachImages(rows, replace, folder);
    }
    bool AttachImages(const std::vector<nedit::ImageRow>& images, bool replace,
                      const std::wstring& folder);
    std::vector<nedit::ImageRow> GetImages() const;

    /// Stores text of a kind on the saved object, replacing text of that kind; false when the
    /// object is not saved.
    bool SaveExtendedData(const std::wstring& text, int kind);
    /// The text of that kind; empty when there is none.
    std::wstring LoadExtendedData(int kind) const;

    /// Selects the objects of this kind that lie in `area` (any of their points inside), or
    /// all of them when the rectangle is empty or all zero; Next then loads them one by one
    /// in order of identifier. The display mask of the suite's callers changes nothing.
    /// Gives how many were selected.
    int Enumerate(const UWRect& area, unsigned mask = 0);
    /// Loads the next selected object and gives its identifier; 0 at the end.
    long Next();

    const std::wstring& LastError() const { return last_error_; }

  protected:
    UDBObject(USurveyDoc* job, int kind, const char* table);
    nedit::JobDatabase& Job() const;
    /// Checks before an update that the stored object is not locked and still there.
    bool CanUpdate();
    /// Runs a write; a refusal of the schema becomes false with LastError, other failures throw.
    bool Guarded(const std::function<void()>& write);
    void Fail(const std::wstring& message) { last_error_ = message; }
    /// The SQL that selects the identifiers of this kind's objects with a point in the
    /// rectangle ?1..?4 (west, east, south, north), in order.
    virtual const char* AreaQuery() const = 0;

    USurveyDoc* job_;
    int kind_;
    const char* table_;
    long id_ = 0;
    long layer_ = 0;
    int colour_ = 15;
    unsigned flags_ = 0;
    std::wstring last_error_;
    std::vector<long> walk_;
    std::size_t walk_next_ = 0;
};
