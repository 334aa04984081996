#pragma once

namespace KolbaVizCore {

/// An axis-aligned box of doubles; it can be empty (low above high on every axis).
class VizBox {
public:
    VizBox(); ///< empty
    VizBox(double const* low, double const* high);

    bool IsEmpty() const;
    void Add(VizBox const& other); ///< an empty box adds nothing
    void Add(double const* point);
    double const* GetLow() const { return m_low; }
    double const* GetHigh() const { return m_high; }
    /// Writes the centre into `center` (3 doubles); all zero for an empty box.
    void GetCenter(double* center) const;
    /// Scales the box about the origin, as VizTransf(factor) moves its points; an empty box
    /// stays empty.
    void Scale(double const& factor);

    bool operator==(VizBox const& other) const;

private:
    double m_low[3];
    double m_high[3];
};

} // namespace KolbaVizCore
