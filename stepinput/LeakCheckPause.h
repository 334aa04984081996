#pragma once

#if defined(__SANITIZE_ADDRESS__)
#define VIZBRIDGE_STEP_LEAK_CHECKS 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define VIZBRIDGE_STEP_LEAK_CHECKS 1
#endif
#endif

#ifdef VIZBRIDGE_STEP_LEAK_CHECKS
#include <sanitizer/lsan_interface.h>
#endif

namespace VizBridgeStep {

/// While it lives, LeakSanitizer leaves out what this thread allocates: for Open CASCADE's
/// process-wide objects, which it makes once and frees never, by design. Nothing without a
/// sanitizer.
class LeakCheckPause {
public:
#ifdef VIZBRIDGE_STEP_LEAK_CHECKS
    LeakCheckPause() {
        __lsan_disable();
    }
    ~LeakCheckPause() {
        __lsan_enable();
    }
#else
    // Not trivial, so that a pause in a scope is not taken for an unused variable.
    LeakCheckPause() {}
    ~LeakCheckPause() {}
#endif
    LeakCheckPause(LeakCheckPause const&) = delete;
    LeakCheckPause& operator=(LeakCheckPause const&) = delete;
};

} // namespace VizBridgeStep
