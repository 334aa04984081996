#pragma once

namespace KolbaVizCore {

/// The library-wide throw switch: when true, a failure that the system would otherwise
/// only record is thrown on to the host. Off by default; process-wide.
bool GetAllowThrow();
void SetAllowThrow(bool allow);

/// Sets the switch for one scope and restores the old value afterwards.
class ScopedAllowThrow {
public:
    explicit ScopedAllowThrow(bool allow) : m_previous(GetAllowThrow()) { SetAllowThrow(allow); }
    ~ScopedAllowThrow() { SetAllowThrow(m_previous); }
    ScopedAllowThrow(ScopedAllowThrow const&) = delete;
    ScopedAllowThrow& operator=(ScopedAllowThrow const&) = delete;

private:
    bool m_previous;
};

} // namespace KolbaVizCore
