#pragma once
#include <utility>

namespace quire::ooxml {

// An optional child element held by its parent: null when absent, copied deeply with the
// parent, so that bound documents copy as values.
template <class T>
class c_owned {
public:
    c_owned() = default;
    c_owned(const c_owned& other) : object_(other.object_ ? new T(*other.object_) : nullptr) {}
    c_owned(c_owned&& other) noexcept : object_(other.object_) { other.object_ = nullptr; }
    c_owned& operator=(const c_owned& other) {
        if (this != &other) {
            T* copy = other.object_ ? new T(*other.object_) : nullptr;
            delete object_;
            object_ = copy;
        }
        return *this;
    }
    c_owned& operator=(c_owned&& other) noexcept {
        if (this != &other) {
            delete object_;
            object_ = other.object_;
            other.object_ = nullptr;
        }
        return *this;
    }
    ~c_owned() { delete object_; }

    T* get() const { return object_; }
    T& create() {
        if (!object_) object_ = new T();
        return *object_;
    }
    void reset() {
        delete object_;
        object_ = nullptr;
    }
    explicit operator bool() const { return object_ != nullptr; }
    T* operator->() const { return object_; }
    T& operator*() const { return *object_; }

private:
    T* object_ = nullptr;
};

}  // namespace quire::ooxml
