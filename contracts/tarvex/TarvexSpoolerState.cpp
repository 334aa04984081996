#include <VizBridge/contracts/tarvex/TarvexSpoolerState.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPartConversion.h>

#include <algorithm>
#include <set>

TarvexSpoolerState::TarvexSpoolerState(std::shared_ptr<TarvexModelData const> data)
    : m_data(std::move(data)) {}

TarvexSpoolerState::~TarvexSpoolerState() {
    m_stop.store(true);
    for (std::thread& worker : m_workers) {
        worker.join();
    }
}

bool TarvexSpoolerState::Start() {
    if (m_started) {
        return false;
    }
    collectJobs();
    m_converted.assign(m_jobs.size(), std::nullopt);
    if (!m_jobs.empty()) {
        int const toUse = TarvexMultiProcess::GetNumberOfProcessorsToUse();
        int const processors =
            toUse == 0 ? TarvexMultiProcess::GetNumberOfPhysicalProcessors() : toUse;
        startWorkers(std::clamp<std::size_t>(static_cast<std::size_t>(std::max(processors, 1)), 1,
                                             m_jobs.size()));
    }
    m_started = true;
    return true;
}

void TarvexSpoolerState::collectJobs() {
    // Starts afresh: a start whose workers could not be made may be tried again.
    m_jobs.clear();
    m_jobOfReference.clear();
    if (!m_data) {
        return;
    }
    // Depth first, each reference once; the visited set also ends the walk when an authored
    // assembly places itself. References placed but never added have nothing to convert.
    std::vector<Job> walked;
    std::set<unsigned int> visited;
    std::vector<unsigned int> pending(m_data->rootInstances.rbegin(), m_data->rootInstances.rend());
    while (!pending.empty()) {
        TarvexAuthoredInstance const* const instance = m_data->FindInstance(pending.back());
        pending.pop_back();
        if (instance == nullptr) {
            continue;
        }
        TarvexAuthoredReference const* const reference =
            m_data->FindReference(instance->referenceId);
        if (reference == nullptr || !visited.insert(reference->uniqueId).second) {
            continue;
        }
        if (reference->isPart) {
            walked.push_back(Job{reference->uniqueId, &reference->geometry});
        } else {
            pending.insert(pending.end(), reference->instances.rbegin(),
                           reference->instances.rend());
        }
    }

    // Listed parts are converted first, so that the order the model prescribes holds back
    // as little as it can. Ids that name no part of this product are passed over.
    std::map<unsigned int, Job> parts;
    for (Job const& job : walked) {
        parts.emplace(job.referenceId, job);
    }
    for (unsigned int const listed : m_data->spoolerDeliveryOrder) {
        auto const part = parts.find(listed);
        if (part != parts.end() && m_jobOfReference.emplace(listed, m_jobs.size()).second) {
            m_jobs.push_back(part->second);
        }
    }
    m_listedCount = m_jobs.size();
    for (Job const& job : walked) {
        if (m_jobOfReference.emplace(job.referenceId, m_jobs.size()).second) {
            m_jobs.push_back(job);
        }
    }
    m_aliases = m_data->spoolerIdAliases;
}

void TarvexSpoolerState::startWorkers(std::size_t count) {
    for (std::size_t worker = 0; worker < count; ++worker) {
        try {
            m_workers.emplace_back([this] { work(); });
        } catch (...) {
            // The workers that did start take every job between them; only with none at
            // all can nothing be converted.
            if (m_workers.empty()) {
                throw;
            }
            return;
        }
    }
}

void TarvexSpoolerState::work() {
    while (!m_stop.load()) {
        std::size_t const job = m_nextJob.fetch_add(1);
        if (job >= m_jobs.size()) {
            return;
        }
        try {
            m_data->conversions.Convert(m_jobs[job].referenceId, *m_jobs[job].geometry);
        } catch (...) {
            // An exception must not leave the thread; the part is handed over as not
            // converted, so that the spooler still completes.
            std::lock_guard<std::mutex> const lock(m_mutex);
            m_brokenJobs.push_back(job);
        }
    }
}

void TarvexSpoolerState::collectFinished() {
    auto const note = [this](std::size_t job, bool converted) {
        if (!m_converted[job]) {
            m_converted[job] = converted;
            m_finishOrder.push_back(job);
        }
    };
    std::vector<TarvexPartConversion::Finished> finished;
    m_data->conversions.CollectFinished(m_conversionsCursor, finished);
    for (TarvexPartConversion::Finished const& conversion : finished) {
        // The model's conversions also hold parts of no interest here, and parts that the
        // caller's thread converted, before or during this spooler's run.
        auto const job = m_jobOfReference.find(conversion.referenceId);
        if (job != m_jobOfReference.end()) {
            note(job->second, conversion.converted);
        }
    }
    std::lock_guard<std::mutex> const lock(m_mutex);
    for (std::size_t const job : m_brokenJobs) {
        note(job, false);
    }
    m_brokenJobs.clear();
}

bool TarvexSpoolerState::IsComplete() const {
    return !m_started || m_delivered == m_jobs.size();
}

bool TarvexSpoolerState::Deliver(unsigned int& id) {
    if (!m_started || IsComplete()) {
        return false;
    }
    collectFinished();
    if (m_nextListed < m_listedCount) {
        if (!m_converted[m_nextListed]) {
            return false;
        }
        handOver(m_nextListed++, id);
        return true;
    }
    // The listed jobs are all handed over by now; the rest go in the order they finished.
    while (m_nextFinished < m_finishOrder.size() && m_finishOrder[m_nextFinished] < m_listedCount) {
        ++m_nextFinished;
    }
    if (m_nextFinished == m_finishOrder.size()) {
        return false;
    }
    handOver(m_finishOrder[m_nextFinished++], id);
    return true;
}

void TarvexSpoolerState::handOver(std::size_t job, unsigned int& id) {
    unsigned int const referenceId = m_jobs[job].referenceId;
    auto const alias = m_aliases.find(referenceId);
    id = alias == m_aliases.end() ? referenceId : alias->second;
    m_active = *m_converted[job] ? TarvexRep_BREP : TarvexRep_None;
    ++m_delivered;
}
