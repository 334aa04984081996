#include <VizBridge/semantic/SemanticFormat.h>

#include <VizBridge/contracts/platform/FormatW.h>

#include <cstddef>

namespace VizBridgeTarvex {

namespace {

constexpr std::size_t kNumberBuffer = 64;
constexpr std::size_t kTupleBuffer = 1024;
constexpr std::size_t kEntityIdBuffer = 128;

/// Each value behind the one before, in what is left of one buffer: "%f, " for all but the
/// last, "%f)" for the last. Floats reach here widened to double.
template <class Value> WString formatTuple(int count, Value const* values) {
    if (count < 1 || values == nullptr) {
        return WString();
    }
    WString tuple(u"(");
    for (int index = 0; index < count; ++index) {
        std::size_t const left = kTupleBuffer - tuple.size();
        if (left <= 1) {
            break;
        }
        tuple += VizPort::FormatW(left, index + 1 < count ? u"%f, " : u"%f)",
                                  {static_cast<double>(values[index])});
    }
    return tuple;
}

} // namespace

WString ToWString(TarvexWString const& text) {
    char16_t const* characters = nullptr;
    text.ToWChar(characters);
    return characters ? WString(characters) : WString();
}

WString FormatBool(bool value) {
    return value ? u"true" : u"false";
}

WString FormatInt(int value) {
    return VizPort::FormatW(kNumberBuffer, u"%d", {value});
}

WString FormatFloat(float value) {
    return FormatDouble(static_cast<double>(value));
}

WString FormatDouble(double value) {
    return VizPort::FormatW(kNumberBuffer, u"%f", {value});
}

WString FormatFloats(int count, float const* values) {
    return formatTuple(count, values);
}

WString FormatDoubles(int count, double const* values) {
    return formatTuple(count, values);
}

WString FormatEntityId(KolbaVizCore::EntityId entity) {
    return VizPort::FormatW(kEntityIdBuffer, u"[%d, %d, %d]",
                            {static_cast<int>(entity.GetParentId()),
                             static_cast<int>(entity.GetType()), static_cast<int>(entity.GetId())});
}

WString JoinStrings(std::vector<WString> parts, WString separator) {
    WString joined;
    for (std::size_t index = 0; index < parts.size(); ++index) {
        if (index > 0) {
            joined += separator;
        }
        joined += parts[index];
    }
    return joined;
}

} // namespace VizBridgeTarvex
