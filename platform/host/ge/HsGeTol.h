// The two tolerances of the geometry: when points are equal, and when vectors are parallel.
#pragma once

class HsGeTol {
public:
    constexpr HsGeTol() = default;
    constexpr HsGeTol(double equalPoint, double equalVector)
        : m_equalPoint(equalPoint), m_equalVector(equalVector) {}

    // The first value: two points closer than this are the same point.
    double equalPoint() const { return m_equalPoint; }
    // Two unit directions closer than this are the same direction.
    double equalVector() const { return m_equalVector; }
    void setEqualPoint(double value) { m_equalPoint = value; }
    void setEqualVector(double value) { m_equalVector = value; }

private:
    double m_equalPoint = 1e-10;
    double m_equalVector = 1e-10;
};
