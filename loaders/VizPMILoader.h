#pragma once

#include <VizBridge/contracts/kolba/AVizPMILoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one tessellated PMI: its group and type, its edges, its texts (as real text, or as
/// the strokes and filled shapes of the text builder when texts are tessellated), its name,
/// its visual and mechanical ids, the visual ids of the part entities it points at, and
/// whether a node above it hides it. A PMI with nothing to show loads as null.
///
/// A text that cannot be tessellated stays as a yellow text "Failed to Tesselate Text!" at
/// its place, and the other texts go on.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizPMILoader : public KolbaVizCore::AVizPMILoader {
public:
    /// `attributes` may be null. The group is that of `nodeTypeForGroup`, the type is
    /// `nodeType`'s own. With `tesselateText`, every non-empty text becomes geometry.
    VizPMILoader(TarvexVisuPMI const& source, std::vector<TarvexVisuAttributes>* attributes,
                 TarvexVisuNode::TarvexVisuNodeType const& nodeTypeForGroup,
                 TarvexVisuNode::TarvexVisuNodeType const& nodeType, bool const& tesselateText);
    ~VizPMILoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    void loadEdges(KolbaVizCore::VizPMI& pmi) const;
    void loadTexts(KolbaVizCore::VizPMI& pmi) const;
    void loadLinkedEntityIDs(KolbaVizCore::VizPMI& pmi) const;
    /// Whether any entry of the stack hides what stands below it.
    bool isHiddenByStack() const;

    TarvexVisuNode::TarvexVisuNodeType m_groupNodeType;
    TarvexVisuNode::TarvexVisuNodeType m_nodeType;
    bool m_tesselateText;
    std::vector<TarvexVisuAttributes>* m_attributes; ///< not owned, may be null
    TarvexVisuPMI const* m_source;                   ///< not owned
};

} // namespace VizBridgeTarvex
