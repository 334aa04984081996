#pragma once

namespace KolbaVizCore {

/// The renderers' handle on the viewer. The viewing operations arrive with the scene family.
class AView3DAdapter {
public:
    virtual ~AView3DAdapter() = default;
};

} // namespace KolbaVizCore
