#include "model/VizPSInstanceBuilder.h"

#include "contracts/tarvex/TarvexInputPSInstance.h"
#include "contracts/tarvex/TarvexInputPSReference.h"
#include "model/VizPSEntry.h"

#include <memory>

namespace VizBridgeTarvex {

namespace {
WString textOf(TarvexWString const& text) {
    char16_t const* characters = nullptr;
    text.ToWChar(characters);
    return characters ? WString(characters) : WString();
}

std::uint8_t lowByte(unsigned short value) {
    return static_cast<std::uint8_t>(value & 0xFFu);
}
} // namespace

void VizPSInstanceBuilder::MakeVizPSInstance(TarvexInputPSInstance const& instance,
                                             TarvexInputPSReference const& reference,
                                             VizPSEntry*& out) {
    WString const referenceName = textOf(reference.GetReferenceName());
    WString const instanceName = textOf(instance.GetInstanceName());
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
        color.red = lowByte(red);
        color.green = lowByte(green);
        color.blue = lowByte(blue);
    }
    if (hasAlphaValue)
        color.alpha = lowByte(alpha);
    entry->SetColorState(hasColor, color);

    out = entry.release(); // the caller owns it now
}

void VizPSInstanceBuilder::MakeVizPSInstance(int const& id, WString const& name, VizPSEntry*& out) {
    out = new VizPSEntry(static_cast<unsigned long>(id), name, name, true); // caller owns it
}

} // namespace VizBridgeTarvex
