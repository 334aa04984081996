#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPartGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexRep.h>

#include <atomic>
#include <cstddef>
#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <thread>
#include <vector>

class TarvexModelData;

/// The workings of one TarvexMultiProcessSpooler: the parts to convert, the worker threads
/// that convert them through the model's conversions, and the bookkeeping of what was handed
/// over. Internal to the library.
///
/// Threads: the spooler's own thread calls every member. The workers read the job list, which
/// is fixed before they start, take jobs through an atomic counter and report conversions
/// that ended in an exception under a mutex; finished conversions they leave in the model's
/// conversions, where the spooler's thread collects them in the order they finished.
/// Owns its workers and joins them when destroyed; shares the model data so that it outlives
/// them.
class TarvexSpoolerState {
public:
    /// `data` may be null: a spooler on an empty product, which has nothing to convert.
    explicit TarvexSpoolerState(std::shared_ptr<TarvexModelData const> data);
    /// Lets no worker start another part and waits for the parts they are converting.
    ~TarvexSpoolerState();
    TarvexSpoolerState(TarvexSpoolerState const&) = delete;
    TarvexSpoolerState& operator=(TarvexSpoolerState const&) = delete;

    /// Null for a spooler on an empty product.
    TarvexModelData const* Data() const { return m_data.get(); }

    /// Starts converting every unique part reachable from the root instances, on as many
    /// workers as the process settings allow and the parts need. False, and nothing done,
    /// when a conversion was started before.
    bool Start();
    bool IsComplete() const;
    /// Hands over the next part that is due, if its conversion has finished.
    bool Deliver(unsigned int& id);
    TarvexRep GetActiveRepresentation() const { return m_active; }

private:
    struct Job {
        unsigned int referenceId = 0;
        TarvexAuthoredPartGeometry const* geometry = nullptr; ///< the model's; never null
    };

    /// The parts to convert: the ones the model lists for delivery first, in that order, then
    /// the others as a depth-first walk of the product meets them.
    void collectJobs();
    void startWorkers(std::size_t count);
    void work();
    /// Notes the conversions that finished since the last call.
    void collectFinished();
    void handOver(std::size_t job, unsigned int& id);

    std::shared_ptr<TarvexModelData const> m_data;

    // Fixed before the workers start; they only read it.
    std::vector<Job> m_jobs;

    // The spooler's thread only.
    bool m_started = false;
    std::map<unsigned int, std::size_t> m_jobOfReference;
    std::map<unsigned int, unsigned int> m_aliases; ///< delivered id by reference id
    std::size_t m_listedCount = 0; ///< the first jobs, which are handed over in job order
    std::vector<std::optional<bool>> m_converted; ///< per job, once finished: it gave a part
    std::vector<std::size_t> m_finishOrder;       ///< jobs in the order they finished
    std::size_t m_conversionsCursor = 0;          ///< into the model's finished conversions
    std::size_t m_nextListed = 0;
    std::size_t m_nextFinished = 0; ///< into m_finishOrder, for the jobs not listed
    std::size_t m_delivered = 0;
    TarvexRep m_active = TarvexRep_None;

    // Shared with the workers.
    std::atomic<std::size_t> m_nextJob{0};
    std::atomic<bool> m_stop{false};
    std::mutex m_mutex;
    std::vector<std::size_t> m_brokenJobs; ///< under m_mutex: conversions that threw

    std::vector<std::thread> m_workers;
};
