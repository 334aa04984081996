#pragma once

#include <VizBridge/model/VizTypes.h>

#include <string>

namespace VizBridgeTarvex {

/// One part's BREP, in the form of the modeler that imported it. A modeler derives from
/// it (VizModelerServices::ImportPart makes one); the product structure owns it from the
/// moment it is stored there.
class VizPartContainer : public AVizContainer {
public:
    VizPartContainer(VizPartContainer const&) = default;
    VizPartContainer& operator=(VizPartContainer const&) = default;
    ~VizPartContainer() override = default;

    /// The modeler's type text followed by " BREP Container".
    std::string GetTypeName() const override;
    // PickVisual: inherited from AVizContainer.

    /// Kept for the modeler's own use; the system never calls it.
    virtual void ReleaseModelerData() = 0;
    /// The modeler's name for its kind of container, e.g. "Mesh".
    virtual char const* GetModelerTypeName() const = 0;
    /// Kept for the modeler's own use; the system never calls it.
    virtual bool IsModelerDataValid() const = 0;

    WString GetName() const { return m_name; }

protected:
    VizPartContainer(WString const& name, int const& id) : AVizContainer(id), m_name(name) {}

private:
    WString m_name;
};

} // namespace VizBridgeTarvex
