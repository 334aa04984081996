#pragma once

#include <VizBridge/model/VizTypes.h>

#include <string>
#include <vector>

namespace VizBridgeTarvex {

class VizPartContainer;
class VizProductStructure;

/// One instance of the product tree: a placement of a reference under its parent.
/// Its element id is the reference id, so all instances of one reference share it.
/// Created only by VizPSInstanceBuilder; owned by the VizProductStructure it is added to,
/// which deletes it. It points at its children and its structure without owning them.
class VizPSEntry : public VizElement {
public:
    /// Member-wise: a copy points at the same children and the same structure.
    VizPSEntry(VizPSEntry const&) = default;
    VizPSEntry& operator=(VizPSEntry const&) = default;
    /// Leaves the children alone: the product structure deletes every entry itself.
    ~VizPSEntry() override = default;

    std::string const GetElementType() const override { return "VizPSEntry"; }

    /// Appends; a null child is stored as given.
    void AddChild(VizPSEntry* child) { m_children.push_back(child); }
    std::vector<VizPSEntry*> const& GetChildren() const { return m_children; }
    int GetNumberOfChildren() const { return static_cast<int>(m_children.size()); }

    void SetProductStructure(VizProductStructure* structure) { m_productStructure = structure; }
    VizProductStructure* GetProductStructure() const { return m_productStructure; }

    WString GetReferenceName() const { return m_referenceName; }
    WString GetInstanceName() const { return m_instanceName; }
    bool IsPart() const { return m_isPart; }
    bool IsSubAssembly() const { return !m_isPart; }

    void SetHidden(bool const& hidden) { m_hidden = hidden; }
    bool IsHidden() const { return m_hidden; }
    void SetSuppressed(bool const& suppressed) { m_suppressed = suppressed; }
    bool IsSuppressed() const { return m_suppressed; }

    void SetTransformation(VizTransf const& transformation) { m_transformation = transformation; }
    VizTransf const& GetTransformation() const { return m_transformation; }

    /// The four colour bytes, whatever HasColor says.
    RGBAColor GetColor() const { return VizElement::GetColor(); }
    bool HasAlpha() const { return m_hasAlpha; }

    /// The containers of this entry's reference; null without a product structure.
    VizContainer* GetVizContainer() const;
    VizPMIContainer* GetVizPMIContainer() const;
    /// Null for a sub-assembly, even if the structure holds a part container for its id.
    VizPartContainer* GetVizPartContainer() const;

    /// One line per entry, three blanks of indent per level, children below sub-assemblies.
    WString ToString(int depth) const;

private:
    friend class VizPSInstanceBuilder;
    friend class VizProductStructure; // re-points the children of the entries it copies
    VizPSEntry(unsigned long const& id, WString const& referenceName, WString const& instanceName,
               bool const& isPart);

    WString m_referenceName;
    WString m_instanceName;
    bool m_isPart;
    std::vector<VizPSEntry*> m_children;               ///< not owned: the structure's
    VizProductStructure* m_productStructure = nullptr; ///< not owned: the owner of this entry
    bool m_hasAlpha = false;
    bool m_hidden = false;
    bool m_suppressed = false;
    VizTransf m_transformation;
};

} // namespace VizBridgeTarvex
