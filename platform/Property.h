#pragma once
// A value of a control that informs its control when it changes.

#include <utility>

namespace zel {

/// What owns properties: hears of each change.
class PropertyOwner {
  public:
    virtual void noteChange() = 0;

  protected:
    ~PropertyOwner() = default;
};

/// Reads like the value itself; an assignment of a different value notes a change at the owner.
template <class T>
class Property {
  public:
    Property(PropertyOwner* owner, T initial) : owner_(owner), value_(std::move(initial)) {}
    Property(const Property&) = delete;
    Property& operator=(const Property&) = delete;

    const T& get() const { return value_; }
    operator const T&() const { return value_; }

    Property& operator=(T value) {
        if (!(value_ == value)) {
            value_ = std::move(value);
            owner_->noteChange();
        }
        return *this;
    }

  private:
    PropertyOwner* owner_;
    T value_;
};

}  // namespace zel
