#pragma once

#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexModelData;

/// The names of the files that the import could not find. Next() is called before the
/// first Current(); Current() before Next() or past the end gives no text.
class TarvexInputPSMissingFileIter {
public:
    TarvexInputPSMissingFileIter() = default;
    explicit TarvexInputPSMissingFileIter(std::shared_ptr<TarvexModelData const> data)
        : m_data(std::move(data)) {}

    int GetCount() const;
    bool Next();
    TarvexWString Current() const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
    int m_position = -1;
};
