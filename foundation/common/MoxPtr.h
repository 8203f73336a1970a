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

    /// Takes one more reference.
    MoxPtr(const MoxPtr& other) : target(other.target) { addRef(); }

    /// Takes the reference of `other` over.
    MoxPtr(MoxPtr&& other) noexcept : target(std::exchange(other.target, nullptr)) {}

    /// Takes a reference to what a pointer to a derived class holds.
    template <typename U>
    MoxPtr(const MoxPtr<U>& other) : target(other.get()) { // NOLINT(google-explicit-constructor)
        addRef();
    }

    ~MoxPtr() { release(); }

    /// Takes one more reference and lets go of the old object.
    // NOLINTNEXTLINE(bugprone-unhandled-self-assignment): the form for plain pointers handles it
    MoxPtr& operator=(const MoxPtr& other) { return *this = other.target; }

    /// Takes the reference of `other` over and lets go of the old object.
    MoxPtr& operator=(MoxPtr&& other) noexcept {
        MoxPtr(std::move(other)).swap(*this);
        return *this;
    }

    /// Takes a reference to `object` and lets go of the old one. Ignores: the object it holds.
    MoxPtr& operator=(T* object) {
        MoxPtr(object).swap(*this);
        return *this;
    }

    /// Exchanges the references.
    void swap(MoxPtr& other) noexcept { std::swap(target, other.target); }

    /// Returns: the object, borrowed, or null.
    T* get() const { return target; }

    /// Returns: the object, which must be there.
    T* operator->() const { return target; }

    /// Returns: the object, which must be there.
    T& operator*() const { return *target; }

    /// Returns: whether it holds an object.
    explicit operator bool() const { return target != nullptr; }

    /// True when both are the same.
    bool operator==(const MoxPtr& other) const { return target == other.target; }

    /// True when both are the same.
    bool operator==(const T* other) const { return target == other; }

    /// True when both are the same.
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
