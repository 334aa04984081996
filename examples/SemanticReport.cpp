#include "SemanticReport.h"

#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumTargetIter.h>
#include <VizBridge/semantic/SemanticFormat.h>
#include <VizBridge/semantic/VizCapturePMILoader.h>
#include <VizBridge/semantic/VizDatumSemanticPMILoader.h>
#include <VizBridge/semantic/VizDatumTargetSemanticPMILoader.h>
#include <VizBridge/semantic/VizDimensionSemanticPMILoader.h>
#include <VizBridge/semantic/VizGDTSemanticPMILoader.h>
#include <VizBridge/semantic/VizNoteSemanticPMILoader.h>
#include <VizBridge/semantic/VizRoughnessSemanticPMILoader.h>
#include <VizBridge/semantic/VizViewSemanticPMILoader.h>

#include <map>
#include <vector>

namespace VizBridgeExamples {

namespace {

using namespace VizBridgeTarvex;
using Records = std::map<WString, SemanticPMI>;

/// One record per id: a second visit of an object adds to the record that is there.
SemanticPMI& recordOf(Records& records, TarvexPMIObject const& object) {
    WString const id = ToWString(object.GetID());
    SemanticPMI& record = records[id];
    record.ID = id;
    return record;
}

template <class Loader, class Object>
void loadAs(TarvexPMIAnnotation& annotation, Records& records) {
    auto& object = static_cast<Object&>(annotation);
    Loader(object, recordOf(records, object)).Load();
}

void loadAnnotation(TarvexPMIAnnotation& annotation, Records& records) {
    switch (annotation.GetObjectType()) {
    case TarvexPMI_Datum: {
        loadAs<VizDatumSemanticPMILoader, TarvexPMIDatum>(annotation, records);
        TarvexPMIDatumTargetIter targets =
            static_cast<TarvexPMIDatum&>(annotation).GetDatumTargetIterator();
        for (int index = 0; targets.Next(); ++index) {
            TarvexPMIDatumTarget target = targets.Current();
            WString prefix(u"_");
            prefix += FormatInt(index);
            VizDatumTargetSemanticPMILoader(target, recordOf(records, target), prefix).Load();
        }
        break;
    }
    case TarvexPMI_DatumTarget: {
        auto& target = static_cast<TarvexPMIDatumTarget&>(annotation);
        VizDatumTargetSemanticPMILoader(target, recordOf(records, target), WString()).Load();
        break;
    }
    case TarvexPMI_Note:
    case TarvexPMI_FlagNote:
    case TarvexPMI_NOA:
        loadAs<VizNoteSemanticPMILoader, TarvexPMINote>(annotation, records);
        break;
    case TarvexPMI_Roughness:
        loadAs<VizRoughnessSemanticPMILoader, TarvexPMIRoughness>(annotation, records);
        break;
    case TarvexPMI_GDT:
        loadAs<VizGDTSemanticPMILoader, TarvexPMIGDT>(annotation, records);
        break;
    case TarvexPMI_Dimension:
        loadAs<VizDimensionSemanticPMILoader, TarvexPMIDimension>(annotation, records);
        break;
    default:
        VizAnnotationPMILoader(annotation, recordOf(records, annotation)).Load();
        break;
    }
}

} // namespace

void PrintSemanticRecords(std::ostream& out, TarvexModel const& model, SamplePMI const& pmi) {
    Records records;
    auto view = model.MakePMIObject<TarvexPMIAnnotationView>(*pmi.front);
    VizViewSemanticPMILoader(view, recordOf(records, view)).Load();
    TarvexPMIAnnotationIter annotations = view.GetAnnotationIterator();
    while (annotations.Next()) {
        loadAnnotation(annotations.Current(), records);
    }
    auto capture = model.MakePMIObject<TarvexPMICapture>(*pmi.inspection);
    VizCapturePMILoader(capture, recordOf(records, capture)).Load();

    for (auto const& [id, record] : records) {
        out << "  " << VizPort::Narrow(id) << " \"" << VizPort::Narrow(record.Name) << '"';
        if (!record.Label.empty()) {
            out << ", label \"" << VizPort::Narrow(record.Label) << '"';
        }
        out << '\n';
        for (auto const& [key, value] : record.Properties) {
            out << "      " << VizPort::Narrow(key) << " = " << VizPort::Narrow(value) << '\n';
        }
    }
}

} // namespace VizBridgeExamples
