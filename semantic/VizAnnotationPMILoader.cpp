#include <VizBridge/semantic/VizAnnotationPMILoader.h>

#include <VizBridge/contracts/tarvex/TarvexPMILeaderIter.h>
#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizAnnotationPMILoader::LoadSemantics() {
    loadPositioning();
    loadLeaders();
    auto const& annotation = object<TarvexPMIAnnotation>();
    int const count = annotation.GetLinkedElementsCount();
    for (int index = 0; index < count; ++index) {
        TarvexEntity entity;
        annotation.GetLinkedElement(index, entity);
        m_entities.push_back(entity);
    }
}

void VizAnnotationPMILoader::loadPositioning() {
    float position[2] = {0, 0};
    TarvexPMIOrientation orientation = TarvexPMI_Horizontal;
    float angle = 0;
    float zDepth = 0;
    if (!object<TarvexPMIAnnotation>().GetPositioning(position, orientation, angle, zDepth)) {
        return;
    }
    write(u"Position", FormatFloats(2, position));
    write(u"Orientation", OrientationToText(orientation));
    write(u"Angle", FormatFloat(angle));
    write(u"Z Depth", FormatFloat(zDepth));
}

// All leaders go into one text, one behind the other; the key is rewritten after each
// leader, so that it ends with all of them.
void VizAnnotationPMILoader::loadLeaders() {
    WString leaders;
    auto point = [&leaders](TarvexPMILeader const& leader, int index) {
        float first = 0;
        float second = 0;
        leader.GetPoint(index, first, second);
        // Appended piece by piece: a literal in front of a string trips a false -Wrestrict
        // of GCC 12 in optimised builds.
        leaders.append(u"(").append(FormatFloat(first)).append(u", ").append(FormatFloat(second));
    };
    TarvexPMILeaderIter iterator = object<TarvexPMIAnnotation>().GetLeaderIterator();
    while (iterator.Next()) {
        TarvexPMILeader const leader = iterator.Current();
        leaders += u"[ ";
        int const count = leader.GetPointCount();
        for (int index = 0; index < count - 1; ++index) {
            point(leader, index);
            leaders += u"), ";
        }
        if (count > 0) {
            point(leader, count - 1);
            leaders += u")";
        }
        leaders += u" ]";
        write(u"Leader", leaders);
    }
}

} // namespace VizBridgeTarvex
