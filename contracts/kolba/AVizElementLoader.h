#pragma once

#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/VizElement.h>

#include <memory>
#include <vector>

namespace KolbaVizCore {

/// Base of every loader: a loader reads one object of some source and fills one element
/// from it. A loader of one element kind derives from it and says with makeOne which empty
/// element it makes; the loaders of an application derive from that and do the work in
/// loadOne. The base knows nothing of where the data comes from: a derived loader keeps its
/// own source and whatever else it reads.
///
/// Ownership, run by run (one run is one call of Load):
/// - makeOne's element stays the loader's while the run lasts, so loadOne may drop it at any
///   point, by returning null or by throwing, without leaking it.
/// - The element that loadOne returns becomes the caller's of Load.
/// - Every other element that makeOne made during the run is freed when the run ends, with
///   all it has taken over. loadOne must therefore never delete an element of makeOne
///   itself: returning null (or another element) is how it discards one.
/// - A second Load runs loadOne anew and hands out a new element; the first one stays its
///   caller's and is not touched. The loader keeps nothing between runs.
class AVizElementLoader {
public:
    AVizElementLoader() = default;
    // Holds the elements of a running Load.
    AVizElementLoader(AVizElementLoader const&) = delete;
    AVizElementLoader& operator=(AVizElementLoader const&) = delete;
    virtual ~AVizElementLoader() = default;

    /// Runs loadOne and hands back its result, which belongs to the caller from then on.
    /// Null means that nothing was loaded. Exceptions of loadOne pass through, after the
    /// elements of the run have been freed.
    VizElement* Load();

protected:
    /// The empty element of the loader's kind, for loadOne to fill. It stays the loader's
    /// until Load ends (see above); an override that makes its own element hands it over
    /// through keep. Null when no element can be made.
    virtual VizElement* makeOne() = 0;
    /// The whole of a derived loader's work: usually makeOne, check the class, fill the
    /// element, return it; null when there is nothing to load.
    virtual VizElement* loadOne() = 0;

    /// Keeps `element` until the end of the running Load (or, outside a Load, until the
    /// loader goes), and gives its address for makeOne to return. Null stays null.
    /// The element gets an id of its own from the counter of scene node ids: element ids tag
    /// the nodes the elements are drawn in, and these never meet an entity type or a level
    /// tag in a path, nor another element.
    template <class Element> Element* keep(std::unique_ptr<Element> element) {
        Element* const made = element.get();
        if (made != nullptr) {
            made->setID(Node::GetNextId());
            m_kept.push_back(std::move(element)); // on failure `element` still frees it
        }
        return made;
    }

private:
    std::vector<std::unique_ptr<VizElement>> m_kept;
};

} // namespace KolbaVizCore
