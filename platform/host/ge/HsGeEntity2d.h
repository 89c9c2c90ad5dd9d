// The root of the plane geometry objects that are handled through a base pointer.
#pragma once

namespace HsGe {
// What kind of entity an HsGeEntity2d is; tells a wrapped curve's shape apart.
enum EntityId { kLine2d, kLineSeg2d, kCircArc2d };
} // namespace HsGe

class HsGeEntity2d {
public:
    virtual ~HsGeEntity2d();
    virtual HsGe::EntityId type() const = 0;
    // A new entity of the same kind and values; the caller owns it.
    virtual HsGeEntity2d* copy() const = 0;

protected:
    HsGeEntity2d() = default;
    HsGeEntity2d(const HsGeEntity2d&) = default;
    HsGeEntity2d& operator=(const HsGeEntity2d&) = default;
};
