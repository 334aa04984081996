#include <VizBridge/import/VizPSInstanceBuilder.h>

#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/model/VizPSEntry.h>

#include <memory>

namespace VizBridgeTarvex {

void VizPSInstanceBuilder::MakeVizPSInstance(TarvexInputPSInstance const& instance,
                                             TarvexInputPSReference const& reference,
                                             VizPSEntry*& out) {
    WString const referenceName = textOrEmpty(reference.GetReferenceName());
    WString const instanceName = textOrEmpty(instance.GetInstanceName());
    bool const isPart = reference.IsPart();
    unsigned long const id = reference.GetUniqueID();

    // Held here until complete: an exception of the import library frees it.
    std::unique_ptr<VizPSEntry> entry(new VizPSEntry(id, referenceName, instanceName, isPart));

    double rotation[3][3] = {{1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
    double translation[3] = {0, 0, 0};
    instance.GetInstancePositionMatrix(rotation, translation);
    entry->SetTransformation(VizTransf(rotation, translation));

    bool hidden = false;
    if (instance.GetHidden(hidden))
        entry->SetHidden(hidden);
    bool suppressed = false;
    if (instance.GetSuppressed(suppressed))
        entry->SetSuppressed(suppressed);

    unsigned short red = 0, green = 0, blue = 0, alpha = 0;
    bool const hasColor = instance.GetRGBColor(red, green, blue);
    bool const hasAlphaValue = instance.GetAlphaColor(alpha);
    entry->m_hasAlpha = hasAlphaValue && alpha != 255;

    RGBAColor color = entry->GetColor();
    if (hasColor) {
        color.red = colorByte(red);
        color.green = colorByte(green);
        color.blue = colorByte(blue);
    }
    if (hasAlphaValue)
        color.alpha = colorByte(alpha);
    entry->SetColorState(hasColor, color);

    out = entry.release(); // the caller owns it now
}

void VizPSInstanceBuilder::MakeVizPSInstance(int const& id, WString const& name, VizPSEntry*& out) {
    out = new VizPSEntry(static_cast<unsigned long>(id), name, name, true); // caller owns it
}

} // namespace VizBridgeTarvex
