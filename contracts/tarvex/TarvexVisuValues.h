#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <array>
#include <optional>
#include <vector>

/// How the value objects of the visualisation data answer their optional getters: true and
/// the value when it is present, false and the arguments left alone when it is not, or when
/// there is no record at all. Internal to the library.
class TarvexVisuValues {
public:
    using Triples = std::array<std::array<float, 3>, 3>;

    static bool Text(std::optional<VizPort::WString> const* value, TarvexWString& text);
    static bool Flag(std::optional<bool> const* value, bool& flag);
    static bool Rgb(std::optional<std::array<unsigned short, 3>> const* value, unsigned short& red,
                    unsigned short& green, unsigned short& blue);
    static bool Alpha(std::optional<unsigned short> const* value, unsigned short& alpha);
    static bool Number(std::optional<float> const* value, float& number);
    /// Fills the three arrays of three floats each, in order.
    static bool ThreeTriples(std::optional<Triples> const* value, float* first, float* second,
                             float* third);
    /// Points `indices` at the array and gives its length; an absent array gives null and 0,
    /// while a present empty one gives a pointer that is not null.
    static int Indices(std::optional<std::vector<int>> const* value, int const*& indices);
    /// Points `values` at the floats and gives their number; null and 0 without a record.
    static int Floats(std::vector<float> const* value, float const*& values);
    /// The text, or no text when there is no record.
    static TarvexWString TextOrNone(std::optional<VizPort::WString> const* value);

    /// A pointer to the member `field` of `record`, null when `record` is.
    template <class Record, class Field>
    static Field const* Member(Record const* record, Field Record::*field) {
        return record == nullptr ? nullptr : &(record->*field);
    }
};
