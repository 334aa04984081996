#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPartGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexConvertedPart.h>

#include <condition_variable>
#include <cstddef>
#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <thread>
#include <vector>

/// The conversions of one model's parts into modeler-ready form, keyed by reference id.
/// Each part is converted at most once, whichever thread asks first; a thread that asks while
/// another converts the same part waits for that result. Results, failures included, are kept
/// for the life of the model, so later authoring of a converted part's geometry is not seen.
/// Internal to the library; thread-safe. Owns the converted parts it hands out shares of.
class TarvexPartConversion {
public:
    /// One finished conversion, in the order in which conversions finish.
    struct Finished {
        unsigned int referenceId = 0;
        bool converted = false; ///< false: the conversion failed and gave no part
    };

    /// The converted part of `referenceId`, converting `geometry` on this thread unless it was
    /// converted or is being converted already. Null when the conversion fails.
    std::shared_ptr<TarvexConvertedPart const> Convert(unsigned int referenceId,
                                                       TarvexAuthoredPartGeometry const& geometry);

    /// Appends the conversions that finished since `cursor` to `finished` and moves `cursor`
    /// past them. A cursor starting at 0 sees every conversion the model ever finished.
    void CollectFinished(std::size_t& cursor, std::vector<Finished>& finished) const;

    // Diagnostics for tests.
    /// How many times the conversion of `referenceId` ran (started): 0 or 1, unless a run
    /// ended in an exception and was tried again.
    int GetConversionCount(unsigned int referenceId) const;
    /// The thread that last ran the conversion of `referenceId`, if one ran.
    std::optional<std::thread::id> GetConversionThread(unsigned int referenceId) const;

private:
    struct Slot {
        bool running = false;
        bool done = false;
        std::shared_ptr<TarvexConvertedPart const> part;
        int runs = 0;
        std::optional<std::thread::id> thread;
    };

    mutable std::mutex m_mutex;
    std::condition_variable m_changed; ///< a conversion finished or gave up
    std::map<unsigned int, Slot> m_slots;
    std::vector<Finished> m_finished;
};
