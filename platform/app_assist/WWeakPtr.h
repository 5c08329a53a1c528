/**
 * @file
 * @brief Pointers that know whether their object still lives.
 */
#pragma once

#include <memory>

namespace app_assist {

template <class T>
class WWeakPtr;

/** Held by an object that hands out weak pointers; they expire with it. */
class WLifeToken {
public:
    WLifeToken() : _alive(std::make_shared<char>()) {}
    WLifeToken(const WLifeToken&) = delete;
    WLifeToken& operator=(const WLifeToken&) = delete;

private:
    template <class T>
    friend class WWeakPtr;
    std::shared_ptr<char> _alive;
};

/** A pointer that does not own its object and turns null when the object dies. */
template <class T>
class WWeakPtr {
public:
    WWeakPtr() = default;
    WWeakPtr(T* object, const WLifeToken& token) : _object(object), _alive(token._alive) {}

    /** The object, or null when it is gone. */
    T* get() const { return _alive.expired() ? nullptr : _object; }
    bool expired() const { return get() == nullptr; }
    explicit operator bool() const { return get() != nullptr; }
    T* operator->() const { return get(); }
    /** Forgets the object. */
    void reset() { *this = WWeakPtr(); }

private:
    T* _object = nullptr;
    std::weak_ptr<char> _alive;
};

} // namespace app_assist
