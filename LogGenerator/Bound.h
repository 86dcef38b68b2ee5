#pragma once

#include <memory>

namespace orvex {

// A container of the display that somebody else owns, and whether it is still there.
//
// A weak reference that is not locked for each look: sections and display live on one thread, and no packet
// takes the display away while it is decoded.
template <typename Container>
class Bound {
public:
    Bound() = default;
    Bound& operator=(const std::shared_ptr<Container>& container)
    {
        _owner = container;
        _container = container.get();
        return *this;
    }

    // Null when nothing is bound, or it is gone.
    Container* get() const { return _owner.expired() ? nullptr : _container; }

private:
    std::weak_ptr<Container> _owner;
    Container* _container = nullptr;
};

} // namespace orvex
