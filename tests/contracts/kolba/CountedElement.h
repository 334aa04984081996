#pragma once

// An element that counts its own destruction, so that tests can tell that whoever took it
// over freed it, and freed it once.

#include <memory>
#include <utility>

namespace CountedElement {

template <class Element> class Counted : public Element {
public:
    template <class... Args>
    explicit Counted(int& freed, Args&&... args)
        : Element(std::forward<Args>(args)...), m_freed(freed) {}
    ~Counted() override { ++m_freed; }

private:
    int& m_freed;
};

/// A new counted element, handed over raw as the element interfaces take it.
template <class Element, class... Args> Element* newCounted(int& freed, Args&&... args) {
    return std::make_unique<Counted<Element>>(freed, std::forward<Args>(args)...).release();
}

} // namespace CountedElement
