#pragma once

#include <optional>
#include <string>

/// What a planned fault throws.
enum class TarvexFaultKind {
    StdException,    ///< a std::runtime_error with the fault's `what`
    NonStdException, ///< a TarvexForeignError, which is no std::exception
};

/// Thrown by a NonStdException fault: deliberately not derived from std::exception.
struct TarvexForeignError {
    int code = 0;
};

/// One fault of a TarvexFaultPlan: which operation throws, on which object, and how often.
struct TarvexFault {
    /// "Class::Operation", e.g. "TarvexInputPSReference::GetUniqueID".
    std::string operation;
    /// The object it is limited to: a reference's unique id for reference operations,
    /// an instance's authoring id for instance operations. Absent: every object.
    std::optional<unsigned int> subject;
    TarvexFaultKind kind = TarvexFaultKind::StdException;
    std::string what = "Tarvex fault";
    /// Matching calls that pass before the fault fires.
    int skip = 0;
    /// How many times it fires after that; negative: every time.
    int times = -1;
};
