#pragma once
// A layer of the job: name (unique), colour, point mark, symbol, line style, thickness, and
// whether it is locked (nothing may be saved on it) and active (switched on).

#include <string>

class USurveyDoc;

class UDBLayer {
  public:
    /// The layer of that name: loaded when the job has it, else new (saved by Save).
    UDBLayer(USurveyDoc* job, const std::wstring& name);
    /// The layer with that identifier (a new, nameless one when there is none).
    UDBLayer(USurveyDoc* job, long id);

    bool Load(long id);
    /// Stores the layer; false (LastError) for an empty name or one another layer has.
    bool Save(int undoFlag = 0);

    long GetId() const { return id_; }
    const std::wstring& GetName() const { return name_; }
    void SetName(const std::wstring& name) { name_ = name; }
    int GetColour() const { return colour_; }
    void SetColour(int colour) { colour_ = colour; }
    int GetPointMark() const { return point_mark_; }
    void SetPointMark(int mark) { point_mark_ = mark; }
    int GetSymbol() const { return symbol_; }
    void SetSymbol(int symbol) { symbol_ = symbol; }
    int GetLineStyle() const { return line_style_; }
    void SetLineStyle(int style) { line_style_ = style; }
    int GetThickness() const { return thickness_; }
    void SetThickness(int thickness) { thickness_ = thickness; }
    bool IsLocked() const { return locked_; }
    void SetLocked(bool locked) { locked_ = locked; }
    bool IsActive() const { return active_; }
    void SetActive(bool active) { active_ = active; }
    const std::wstring& LastError() const { return last_error_; }

  private:
    USurveyDoc* job_;
    long id_ = 0;
    std::wstring name_;
    int colour_ = 15;
    int point_mark_ = 0;
    int symbol_ = 0;
    int line_style_ = 0;
    int thickness_ = 0;
    bool locked_ = false;
    bool active_ = true;
    std::wstring last_error_;
};
