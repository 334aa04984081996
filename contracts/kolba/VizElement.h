#pragma once

#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>

namespace KolbaVizCore {

/// Base of every scene element: an element id, a colour state, a hidden flag, a visual id,
/// and, once drawn, the path of its node and its entity id. Owns nothing but its values.
class VizElement {
public:
    VizElement() = default;
    VizElement(VizElement const&) = default;
    VizElement& operator=(VizElement const&) = default;
    virtual ~VizElement() = default;

    /// The element's type name, e.g. "VizMesh".
    virtual std::string const GetElementType() const = 0;

    void setID(unsigned long const& id) { m_id = id; }
    int GetID() const { return static_cast<int>(m_id); }

    /// Sets the four colour bytes and marks the element as coloured.
    void SetColor(RGBAColor const& color) {
        m_color = color;
        m_hasColor = true;
    }
    /// Sets the bytes and the has-colour flag separately: an element may carry an alpha
    /// byte without a colour of its own.
    void SetColorState(bool hasColor, RGBAColor const& color) {
        m_color = color;
        m_hasColor = hasColor;
    }
    bool HasColor() const { return m_hasColor; }
    /// The colour bytes, whatever HasColor says.
    RGBAColor GetColor() const { return m_color; }

    void SetHidden(bool const& hidden) { m_hidden = hidden; }
    bool GetHidden() const { return m_hidden; }

    void SetVisualID(VizPort::WString const& id) { m_visualId = id; }
    VizPort::WString GetVisualID() const { return m_visualId; }

    void Set3DRenderID(RenderId const& id) {
        m_renderId = id;
        m_hasRenderId = true;
    }
    /// False, and `id` untouched, until the element has been drawn.
    bool Get3DRenderID(RenderId& id) const {
        if (m_hasRenderId)
            id = m_renderId;
        return m_hasRenderId;
    }
    /// The render id without a copy, null until the element has been drawn: for the scene
    /// library's own searches over many elements.
    RenderId const* Find3DRenderID() const { return m_hasRenderId ? &m_renderId : nullptr; }

    void SetEntityID(EntityId const& id) {
        m_entityId = id;
        m_hasEntityId = true;
    }
    bool GetEntityID(EntityId& id) const {
        if (m_hasEntityId)
            id = m_entityId;
        return m_hasEntityId;
    }

private:
    unsigned long m_id = 0;
    bool m_hasColor = false;
    RGBAColor m_color;
    bool m_hidden = false;
    VizPort::WString m_visualId;
    bool m_hasRenderId = false;
    RenderId m_renderId;
    bool m_hasEntityId = false;
    EntityId m_entityId;
};

} // namespace KolbaVizCore
