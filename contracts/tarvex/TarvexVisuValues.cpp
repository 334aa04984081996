#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

bool TarvexVisuValues::Text(std::optional<VizPort::WString> const* value, TarvexWString& text) {
    if (value == nullptr || !*value) {
        return false;
    }
    text = TarvexWString(**value);
    return true;
}

bool TarvexVisuValues::Flag(std::optional<bool> const* value, bool& flag) {
    if (value == nullptr || !*value) {
        return false;
    }
    flag = **value;
    return true;
}

bool TarvexVisuValues::Rgb(std::optional<std::array<unsigned short, 3>> const* value,
                           unsigned short& red, unsigned short& green, unsigned short& blue) {
    if (value == nullptr || !*value) {
        return false;
    }
    red = (**value)[0];
    green = (**value)[1];
    blue = (**value)[2];
    return true;
}

bool TarvexVisuValues::Alpha(std::optional<unsigned short> const* value, unsigned short& alpha) {
    if (value == nullptr || !*value) {
        return false;
    }
    alpha = **value;
    return true;
}

bool TarvexVisuValues::Number(std::optional<float> const* value, float& number) {
    if (value == nullptr || !*value) {
        return false;
    }
    number = **value;
    return true;
}

bool TarvexVisuValues::ThreeTriples(std::optional<Triples> const* value, float* first,
                                    float* second, float* third) {
    if (value == nullptr || !*value) {
        return false;
    }
    float* const targets[3] = {first, second, third};
    for (std::size_t triple = 0; triple < 3; ++triple) {
        // A caller that wants only some of the three may pass null for the others.
        if (targets[triple] == nullptr) {
            continue;
        }
        for (std::size_t component = 0; component < 3; ++component) {
            targets[triple][component] = (**value)[triple][component];
        }
    }
    return true;
}

TarvexWString TarvexVisuValues::TextOrNone(std::optional<VizPort::WString> const* value) {
    return value == nullptr ? TarvexWString() : TarvexWString(*value);
}

int TarvexVisuValues::Indices(std::optional<std::vector<int>> const* value, int const*& indices) {
    if (value == nullptr || !*value) {
        indices = nullptr;
        return 0;
    }
    // Callers tell an absent array by its null pointer, so an empty one must not look absent;
    // an empty vector may well give null.
    static int const noIndex = 0;
    indices = (*value)->empty() ? &noIndex : (*value)->data();
    return static_cast<int>((*value)->size());
}

int TarvexVisuValues::Floats(std::vector<float> const* value, float const*& values) {
    if (value == nullptr || value->empty()) {
        values = nullptr;
        return 0;
    }
    values = value->data();
    return static_cast<int>(value->size());
}
