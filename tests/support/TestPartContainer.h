#pragma once

#include <VizBridge/model/VizPartContainer.h>

namespace VizBridgeTarvex {

/// A modeler's part container as tests need one: counts how many are alive so that a test
/// can see when the structure frees it.
class TestPartContainer : public VizPartContainer {
public:
    TestPartContainer(WString const& name, int const& id) : VizPartContainer(name, id) {
        ++alive();
    }
    TestPartContainer(TestPartContainer const& other) : VizPartContainer(other) { ++alive(); }
    ~TestPartContainer() override { --alive(); }

    void ReleaseModelerData() override {}
    char const* GetModelerTypeName() const override { return "TestModeler"; }
    bool IsModelerDataValid() const override { return true; }

    static int& alive() {
        static int count = 0;
        return count;
    }
};

} // namespace VizBridgeTarvex
