#pragma once
// A list of job object identifiers, as a selection or an enumeration gives them, walked with
// First and Next.

#include <cstddef>
#include <vector>

class USurveyDoc;

class USVSelectionList {
  public:
    explicit USVSelectionList(USurveyDoc* job = nullptr) : job_(job) {}

    /// Adds the identifier unless it is 0 or already listed; true when added.
    bool Add(long id);
    bool Contains(long id) const;
    void RemoveAll() {
        ids_.clear();
        cursor_ = 0;
    }
    int GetCount() const { return static_cast<int>(ids_.size()); }
    const std::vector<long>& GetIds() const { return ids_; }

    /// The first identifier, 0 when the list is empty; Next gives the one after the last
    /// given, 0 at the end.
    long First();
    long Next();

    USurveyDoc* GetSurveyDoc() const { return job_; }

  private:
    USurveyDoc* job_;
    std::vector<long> ids_;
    std::size_t cursor_ = 0;
};
