/// The owning pointer to counted objects.
#pragma once

#include <cstddef>
#include <utility>

namespace MoxCommonNS {

/// Holds one reference to a `MoxRCObject`, or null.
template <typename T> class MoxPtr {
public:
    MoxPtr() = default;

    /// Takes a reference to `object`; converts from a plain pointer on purpose, since nodes travel
    /// as plain pointers between owners.
    MoxPtr(T* object) : target(object) { // NOLINT(google-explicit-constructor)
        addRef();
    }

    MoxPtr(const MoxPtr& other) : target(other.target) { addRef(); }

    MoxPtr(MoxPtr&& other) noexcept : target(std::exchange(other.target, nullptr)) {}

    /// Takes a reference to what a pointer to a derived class holds.
    template <typename U>
    MoxPtr(const MoxPtr<U>& other) : target(other.get()) { // NOLINT(google-explicit-constructor)
        addRef();
    }

    ~MoxPtr() { release(); }

    // NOLINTNEXTLINE(bugprone-unhandled-self-assignment): the form for plain pointers handles it
    MoxPtr& operator=(const MoxPtr& other) { return *this = other.target; }

    MoxPtr& operator=(MoxPtr&& other) noexcept {
        MoxPtr(std::move(other)).swap(*this);
        return *this;
    }

    MoxPtr& operator=(T* object) {
        MoxPtr(object).swap(*this);
        return *this;
    }

    void swap(MoxPtr& other) noexcept { std::swap(target, other.target); }

    /// Returns: the object, borrowed, or null.
    T* get() const { return target; }

    T* operator->() const { return target; }

    T& operator*() const { return *target; }

    explicit operator bool() const { return target != nullptr; }

    bool operator==(const MoxPtr& other) const { return target == other.target; }

    bool operator==(const T* other) const { return target == other; }

    bool operator==(std::nullptr_t) const { return target == nullptr; }

private:
    void addRef() const {
        if (target) {
            target->addRef();
        }
    }

    void release() const {
        if (target) {
            target->release();
        }
    }

    T* target = nullptr; // owned, by its count
};

} // namespace MoxCommonNS
