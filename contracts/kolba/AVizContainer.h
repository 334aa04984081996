#pragma once

#include <string>

namespace KolbaVizCore {

class AView3DAdapter;
class VizElement;
struct Ray;

/// Base of every container of one reference's data. Holds the reference id only.
class AVizContainer {
public:
    explicit AVizContainer(int const& refId) : m_refId(refId) {}
    AVizContainer(AVizContainer const&) = default;
    AVizContainer& operator=(AVizContainer const&) = default;
    virtual ~AVizContainer() = default;

    virtual std::string GetTypeName() const = 0;
    /// Finds the element that `ray` hits first. The base holds no elements: it answers
    /// false and leaves `element` as it was.
    virtual bool PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element);

    int GetRefID() const { return m_refId; }

private:
    int m_refId;
};

} // namespace KolbaVizCore
