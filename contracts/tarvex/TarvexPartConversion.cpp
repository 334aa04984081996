#include <VizBridge/contracts/tarvex/TarvexPartConversion.h>

#include <algorithm>
#include <chrono>
#include <cmath>

namespace {

/// Grows the box of `part` by the points of `coordinates`, x, y, z each; a trailing
/// incomplete point is no point.
void addPoints(TarvexConvertedPart& part, std::vector<float> const& coordinates) {
    std::size_t const points = coordinates.size() / 3;
    for (std::size_t point = 0; point < points; ++point) {
        for (std::size_t axis = 0; axis < 3; ++axis) {
            double const value = coordinates[3 * point + axis];
            if (part.empty) {
                part.low[axis] = value;
                part.high[axis] = value;
            } else {
                part.low[axis] = std::min(part.low[axis], value);
                part.high[axis] = std::max(part.high[axis], value);
            }
        }
        part.empty = false;
    }
}

/// Appends the unit normal of the triangle (a, b, c), counter-clockwise seen from its front,
/// or a zero vector when the triangle has no area.
void appendNormal(std::vector<float>& normals, float const* a, float const* b, float const* c) {
    double const u[3] = {double(b[0]) - a[0], double(b[1]) - a[1], double(b[2]) - a[2]};
    double const v[3] = {double(c[0]) - a[0], double(c[1]) - a[1], double(c[2]) - a[2]};
    double const n[3] = {u[1] * v[2] - u[2] * v[1], u[2] * v[0] - u[0] * v[2],
                         u[0] * v[1] - u[1] * v[0]};
    double const length = std::sqrt(n[0] * n[0] + n[1] * n[1] + n[2] * n[2]);
    bool const usable = length > 0.0 && std::isfinite(length);
    for (double const component : n) {
        normals.push_back(usable ? static_cast<float>(component / length) : 0.0f);
    }
}

TarvexConvertedPart::Face convertFace(TarvexAuthoredFace const& authored) {
    TarvexConvertedPart::Face face;
    face.entityId = authored.entityId;
    std::size_t const vertexCount = authored.vertices.size() / 3;
    std::size_t const triangleCount = authored.triangles.size() / 3;
    for (std::size_t triangle = 0; triangle < triangleCount; ++triangle) {
        unsigned int const* const corners = &authored.triangles[3 * triangle];
        // A triangle naming a vertex that does not exist is dropped alone: the rest of the
        // face is still worth showing.
        if (std::any_of(corners, corners + 3,
                        [vertexCount](unsigned int index) { return index >= vertexCount; })) {
            continue;
        }
        float const* const a = &authored.vertices[3 * std::size_t(corners[0])];
        float const* const b = &authored.vertices[3 * std::size_t(corners[1])];
        float const* const c = &authored.vertices[3 * std::size_t(corners[2])];
        for (float const* corner : {a, b, c}) {
            face.positions.insert(face.positions.end(), corner, corner + 3);
        }
        appendNormal(face.normals, a, b, c);
    }
    return face;
}

/// Burns `microseconds` of processor time. A sleep would free the processor, which the
/// conversion work it stands for does not.
void spendProcessorTime(unsigned int microseconds) {
    if (microseconds == 0) {
        return;
    }
    auto const end = std::chrono::steady_clock::now() + std::chrono::microseconds(microseconds);
    while (std::chrono::steady_clock::now() < end) {
    }
}

std::shared_ptr<TarvexConvertedPart const> convert(TarvexAuthoredPartGeometry const& geometry) {
    auto part = std::make_shared<TarvexConvertedPart>();
    for (TarvexAuthoredFace const& face : geometry.faces) {
        part->faces.push_back(convertFace(face));
        addPoints(*part, face.vertices);
    }
    for (TarvexAuthoredEdge const& edge : geometry.edges) {
        part->edges.push_back(TarvexConvertedPart::Edge{edge.entityId, edge.points});
        addPoints(*part, edge.points);
    }
    spendProcessorTime(geometry.conversionCostMicroseconds);
    // A failing conversion still costs its time: it fails at the end of its work.
    if (geometry.conversionFails) {
        return nullptr;
    }
    return part;
}

} // namespace

std::shared_ptr<TarvexConvertedPart const>
TarvexPartConversion::Convert(unsigned int referenceId,
                              TarvexAuthoredPartGeometry const& geometry) {
    std::unique_lock<std::mutex> lock(m_mutex);
    // Map nodes never move, so the slot stays valid while the lock is released.
    Slot& slot = m_slots[referenceId];
    m_changed.wait(lock, [&slot] { return !slot.running; });
    if (slot.done) {
        return slot.part;
    }
    slot.running = true;
    ++slot.runs;
    slot.thread = std::this_thread::get_id();
    lock.unlock();

    std::shared_ptr<TarvexConvertedPart const> part;
    try {
        part = convert(geometry);
    } catch (...) {
        // Out of memory, say: nothing is kept, so that a waiting or later caller tries again.
        lock.lock();
        slot.running = false;
        m_changed.notify_all();
        throw;
    }

    lock.lock();
    slot.running = false;
    slot.done = true;
    slot.part = part;
    m_finished.push_back(Finished{referenceId, part != nullptr});
    m_changed.notify_all();
    return part;
}

void TarvexPartConversion::CollectFinished(std::size_t& cursor,
                                           std::vector<Finished>& finished) const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    if (cursor < m_finished.size()) {
        finished.insert(finished.end(), m_finished.begin() + static_cast<std::ptrdiff_t>(cursor),
                        m_finished.end());
        cursor = m_finished.size();
    }
}

int TarvexPartConversion::GetConversionCount(unsigned int referenceId) const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    auto const found = m_slots.find(referenceId);
    return found == m_slots.end() ? 0 : found->second.runs;
}

std::optional<std::thread::id>
TarvexPartConversion::GetConversionThread(unsigned int referenceId) const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    auto const found = m_slots.find(referenceId);
    return found == m_slots.end() ? std::nullopt : found->second.thread;
}
