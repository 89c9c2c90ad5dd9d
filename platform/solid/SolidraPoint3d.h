// A point of the solid modeler: plain coordinates, handed in and out of faces by value.
#pragma once

namespace Solidra {

struct Point3d {
    double x;
    double y;
    double z;
};

} // namespace Solidra
