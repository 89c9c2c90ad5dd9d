// A planar polyline of straight and arc segments, with widths, as an entity of the drawing.
#pragma once

#include "platform/host/db/HsDbEntity.h"
#include "platform/host/ge/HsGePoint2d.h"
#include "platform/host/ge/HsGePoint3d.h"
#include "platform/host/ge/HsGeVector3d.h"

#include <vector>

class HsGeMatrix3d;

// The vertices are points of the polyline's plane, in a right-angled system of unit axes whose
// origin and axes lie in space. The segment from a vertex to the next is straight for bulge 0 and
// otherwise an arc: the bulge is the tangent of a quarter of its angle, positive counter-clockwise
// in the plane. A width below 0 means none was given.
class HsDbPolyline : public HsDbEntity {
    HSRX_DECLARE_MEMBERS(HsDbPolyline)

public:
    unsigned int numVerts() const { return static_cast<unsigned int>(m_vertices.size()); }
    // Inserts before index (numVerts() appends). Needs write. eInvalidIndex past the end,
    // eBadArgument for a value that is not finite.
    Hsys::ErrorStatus addVertexAt(unsigned int index, const HsGePoint2d& point, double bulge = 0.0,
                                  double startWidth = -1.0, double endWidth = -1.0);
    Hsys::ErrorStatus removeVertexAt(unsigned int index);
    // Each gives eInvalidIndex past the end and leaves its output as it was.
    Hsys::ErrorStatus getPointAt(unsigned int index, HsGePoint2d& point) const;
    // The vertex in space.
    Hsys::ErrorStatus getPointAt(unsigned int index, HsGePoint3d& point) const;
    Hsys::ErrorStatus getBulgeAt(unsigned int index, double& bulge) const;
    Hsys::ErrorStatus getWidthsAt(unsigned int index, double& startWidth, double& endWidth) const;

    bool isClosed() const { return m_closed; }
    void setClosed(bool closed);
    // Whether a line type runs on along the whole polyline rather than anew at each vertex.
    bool hasPlinegen() const { return m_plinegen; }
    void setPlinegen(bool plinegen);

    const HsGePoint3d& origin() const { return m_origin; }
    const HsGeVector3d& xAxis() const { return m_xAxis; }
    const HsGeVector3d& yAxis() const { return m_yAxis; }
    HsGeVector3d normal() const { return m_xAxis.crossProduct(m_yAxis); }

    // Moves the polyline by a transformation that keeps circles circles (turns, moves, mirrors and
    // uniform scales); widths scale with it. Needs write. eBadArgument for any other matrix,
    // which leaves the polyline as it was.
    Hsys::ErrorStatus transformBy(const HsGeMatrix3d& xform);

    // A stream with a number that is not finite or axes that are not a right-angled unit system
    // fails the filer with eFilerError.
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    struct Vertex {
        HsGePoint2d point;
        double bulge = 0.0;
        double startWidth = -1.0;
        double endWidth = -1.0;
    };

    const Vertex* vertexAt(unsigned int index) const;

    std::vector<Vertex> m_vertices;
    bool m_closed = false;
    bool m_plinegen = false;
    HsGePoint3d m_origin;
    HsGeVector3d m_xAxis = HsGeVector3d::kXAxis;
    HsGeVector3d m_yAxis = HsGeVector3d::kYAxis;
};
