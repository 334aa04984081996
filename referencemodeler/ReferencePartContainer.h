#pragma once

#include <VizBridge/contracts/tarvex/TarvexConvertedPart.h>
#include <VizBridge/model/VizPartContainer.h>

#include <cstddef>
#include <map>
#include <memory>

namespace VizReferenceModeler {

using VizBridgeTarvex::VizBox;
using VizBridgeTarvex::WString;

/// The reference modeler's BREP of one part: the part document's tessellated faces and
/// edges, each named by its authored entity id.
///
/// Shares the converted part with the document it came from (the part is immutable, so
/// sharing is safe) and owns only its id lookups.
class ReferencePartContainer : public VizBridgeTarvex::VizPartContainer {
public:
    /// `part` may be null: the container then holds no face, no edge and an empty box.
    ReferencePartContainer(WString const& name, int const& refId,
                           std::shared_ptr<TarvexConvertedPart const> part);

    /// Nothing to release: the converted part is shared and immutable, and the lookups
    /// must keep answering for as long as the product structure holds this container.
    void ReleaseModelerData() override;
    /// "Reference": the container's type name reads "Reference BREP Container".
    char const* GetModelerTypeName() const override;
    /// True while the container holds a converted part.
    bool IsModelerDataValid() const override;

    bool HasFace(unsigned long id) const;
    bool HasEdge(unsigned long id) const;
    /// The face or edge with this entity id, or null.
    TarvexConvertedPart::Face const* FindFace(unsigned long id) const;
    TarvexConvertedPart::Edge const* FindEdge(unsigned long id) const;

    /// The part's bounding box, in the part's own coordinates; empty for a part without
    /// points.
    VizBox GetBox() const;

    std::shared_ptr<TarvexConvertedPart const> const& GetConvertedPart() const { return m_part; }

private:
    std::shared_ptr<TarvexConvertedPart const> m_part;
    /// Entity id to position in the part's face / edge list. A repeated id keeps its first
    /// face or edge, so that a lookup always names the same one.
    std::map<unsigned long, std::size_t> m_faceIndex;
    std::map<unsigned long, std::size_t> m_edgeIndex;
};

} // namespace VizReferenceModeler
