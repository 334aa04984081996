#pragma once

#include <string>
#include <vector>

namespace KolbaVizCore {

class AView3DAdapter;
class VizElement;
class VizMesh;
class VizPointSet;
class VizWire;
struct Ray;

/// Base of every container of one reference's data. Holds the reference id only.
class AVizContainer {
public:
    explicit AVizContainer(int const& refId) : m_refId(refId) {}
    AVizContainer(AVizContainer const&) = default;
    AVizContainer& operator=(AVizContainer const&) = default;
    virtual ~AVizContainer() = default;

    virtual std::string GetTypeName() const = 0;
    /// Finds the element that `ray` (world coordinates) hits first in what `view` shows.
    /// The base holds no elements: it answers false and leaves `element` as it was.
    virtual bool PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element);

    int GetRefID() const { return m_refId; }

protected:
    /// The element of `candidates` that `view` picks along `ray`: the one whose render id
    /// the picked path begins with, the longest such id winning, so that a part drawn in a
    /// node of its own wins over its owner. Of equally long ids the first wins: list owners
    /// before their parts, so that a part drawn in its owner's node gives the owner. True and
    /// `element` set when one matches; false and `element` untouched when `view` is null,
    /// picks nothing or nothing of these. Null and never drawn candidates are passed over.
    /// The candidates are the container's; `element` points into it.
    static bool pickAmong(AView3DAdapter* view, Ray const& ray,
                          std::vector<VizElement*> const& candidates, VizElement*& element);
    /// Appends each mesh, followed by its faces and edges, to `candidates`.
    static void addCandidates(std::vector<VizMesh*> const& meshes,
                              std::vector<VizElement*>& candidates);
    /// Appends each wire, followed by its edges.
    static void addCandidates(std::vector<VizWire*> const& wires,
                              std::vector<VizElement*>& candidates);
    /// Appends each point set, followed by its groups of points.
    static void addCandidates(std::vector<VizPointSet*> const& sets,
                              std::vector<VizElement*>& candidates);

private:
    int m_refId;
};

} // namespace KolbaVizCore
