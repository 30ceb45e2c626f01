#pragma once
// A point number of the job: the name under which a point is stored. Names compare exactly,
// case and blanks included; folding case is the business of whoever makes the name.

#include <string>

class UPointNumber {
  public:
    UPointNumber() = default;
    explicit UPointNumber(std::wstring name) : name_(std::move(name)) {}

    const std::wstring& GetName() const { return name_; }
    bool IsEmpty() const { return name_.empty(); }
    bool operator==(const UPointNumber& other) const { return name_ == other.name_; }
    bool operator!=(const UPointNumber& other) const { return name_ != other.name_; }

  private:
    std::wstring name_;
};
