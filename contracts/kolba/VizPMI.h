#pragma once

#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizPMIType.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// One PMI object as it is shown: its group and type, the edges, faces and texts that draw
/// it, its name and ids, and the elements it points at. Owns its edges, faces and texts.
/// Its hidden state is VizElement's.
class VizPMI : public VizElement {
public:
    /// The group and type are fixed for the life of the object.
    VizPMI(VizPMIType const& group, VizPMIType const& type) : m_group(group), m_type(type) {}
    VizPMI(VizPMI const&) = delete;
    VizPMI& operator=(VizPMI const&) = delete;

    static std::string TypeID() { return "VizPMI"; }
    std::string const GetElementType() const override { return TypeID(); }

    VizPMIType GetGroupType() const { return m_group; }
    VizPMIType GetType() const { return m_type; }

    void SetName(VizPort::WString const& name) { m_name = name; }
    VizPort::WString GetName() const { return m_name; }
    void SetMechanicalID(VizPort::WString const& id) { m_mechanicalId = id; }
    VizPort::WString GetMechanicalID() const { return m_mechanicalId; }

    void SetEdgeCountHint(unsigned int count) { m_edges.Reserve(count); }
    /// Takes over `edge`; null is ignored.
    void AddEdge(VizEdge* edge) { m_edges.Add(edge); }
    std::vector<VizEdge*> const& GetEdges() const { return m_edges.Get(); }

    /// Takes over `face`; null is ignored.
    void AddFace(VizFace* face) { m_faces.Add(face); }
    std::vector<VizFace*> const& GetFaces() const { return m_faces.Get(); }

    void SetTextCountHint(unsigned int count) { m_texts.Reserve(count); }
    /// Takes over `text`; null is ignored.
    void AddText(VizText* text) { m_texts.Add(text); }
    std::vector<VizText*> const& GetTexts() const { return m_texts.Get(); }

    /// Visual ids of the elements the PMI points at, in the order the data lists them.
    void SetLinkedEntityIDs(std::vector<VizPort::WString> const& ids) { m_linkedIds = ids; }
    std::vector<VizPort::WString> const& GetLinkedEntityIDs() const { return m_linkedIds; }
    /// Mechanical ids of the same elements, place by place; empty where none is known.
    void SetLinkedEntityMechIDs(std::vector<VizPort::WString> const& ids) { m_linkedMechIds = ids; }
    std::vector<VizPort::WString> const& GetLinkedEntityMechIDs() const { return m_linkedMechIds; }

    /// "PMI : " and the name; empty for a PMI without a name, which has nothing to tell.
    VizPort::WString ToString() const;

private:
    VizPMIType const m_group;
    VizPMIType const m_type;
    VizPort::WString m_name;
    VizPort::WString m_mechanicalId;
    OwnedPointers<VizEdge> m_edges;
    OwnedPointers<VizFace> m_faces;
    OwnedPointers<VizText> m_texts;
    std::vector<VizPort::WString> m_linkedIds;
    std::vector<VizPort::WString> m_linkedMechIds;
};

} // namespace KolbaVizCore
