#include "platform/host/db/HsDbPolyline.h"

#include "platform/host/db/HsDbRegistration.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ge/HsGeMatrix3d.h"

#include <algorithm>
#include <cmath>

HSRX_DEFINE_MEMBERS(HsDbPolyline, HsDbEntity, 0, hsrxInstantiateClass<HsDbPolyline>)
HSDB_REGISTER_AT_LOAD(HsDbPolyline)

namespace {

// Relative tolerance of the tests that a matrix keeps circles and that filed axes are a unit
// system.
constexpr double kShapeTolerance = 1e-9;
// Bytes of a filed vertex: its point and three doubles.
constexpr std::size_t kVertexSize = 40;

bool allFinite(std::initializer_list<double> values) {
    return std::all_of(values.begin(), values.end(), [](double v) { return std::isfinite(v); });
}

bool isUnitSystem(const HsGeVector3d& x, const HsGeVector3d& y) {
    return std::abs(x.length() - 1.0) <= kShapeTolerance &&
           std::abs(y.length() - 1.0) <= kShapeTolerance &&
           std::abs(x.dotProduct(y)) <= kShapeTolerance;
}

void writeVector(HsDbBdfFiler* filer, const HsGeVector3d& v) {
    filer->writePoint3d({v.x, v.y, v.z});
}

Hsys::ErrorStatus readVector(HsDbBdfFiler* filer, HsGeVector3d& v) {
    HsGePoint3d p;
    if (filer->readPoint3d(p) != Hsys::eSuccess)
        return filer->filerStatus();
    v = {p.x, p.y, p.z};
    return Hsys::eSuccess;
}

} // namespace

const HsDbPolyline::Vertex* HsDbPolyline::vertexAt(unsigned int index) const {
    return index < m_vertices.size() ? &m_vertices[index] : nullptr;
}

Hsys::ErrorStatus HsDbPolyline::addVertexAt(unsigned int index, const HsGePoint2d& point,
                                            double bulge, double startWidth, double endWidth) {
    if (index > m_vertices.size())
        return Hsys::eInvalidIndex;
    if (!allFinite({point.x, point.y, bulge, startWidth, endWidth}))
        return Hsys::eBadArgument;
    assertWriteEnabled();
    m_vertices.insert(m_vertices.begin() + index, Vertex{point, bulge, startWidth, endWidth});
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::removeVertexAt(unsigned int index) {
    if (index >= m_vertices.size())
        return Hsys::eInvalidIndex;
    assertWriteEnabled();
    m_vertices.erase(m_vertices.begin() + index);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::getPointAt(unsigned int index, HsGePoint2d& point) const {
    const Vertex* vertex = vertexAt(index);
    if (vertex == nullptr)
        return Hsys::eInvalidIndex;
    point = vertex->point;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::getPointAt(unsigned int index, HsGePoint3d& point) const {
    const Vertex* vertex = vertexAt(index);
    if (vertex == nullptr)
        return Hsys::eInvalidIndex;
    point = m_origin + m_xAxis * vertex->point.x + m_yAxis * vertex->point.y;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::getBulgeAt(unsigned int index, double& bulge) const {
    const Vertex* vertex = vertexAt(index);
    if (vertex == nullptr)
        return Hsys::eInvalidIndex;
    bulge = vertex->bulge;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::getWidthsAt(unsigned int index, double& startWidth,
                                            double& endWidth) const {
    const Vertex* vertex = vertexAt(index);
    if (vertex == nullptr)
        return Hsys::eInvalidIndex;
    startWidth = vertex->startWidth;
    endWidth = vertex->endWidth;
    return Hsys::eSuccess;
}

void HsDbPolyline::setClosed(bool closed) {
    assertWriteEnabled();
    m_closed = closed;
}

void HsDbPolyline::setPlinegen(bool plinegen) {
    assertWriteEnabled();
    m_plinegen = plinegen;
}

Hsys::ErrorStatus HsDbPolyline::transformBy(const HsGeMatrix3d& xform) {
    const HsGeVector3d x = xform * m_xAxis;
    const HsGeVector3d y = xform * m_yAxis;
    const double scale = x.length();
    // The plane's axes stay at right angles and of one length exactly when circles stay circles;
    // the local coordinates then describe the moved polyline once scaled, and mirrored figures
    // need nothing more: the moved axes carry the mirror.
    if (!(scale > 0.0) || !std::isfinite(scale) ||
        std::abs(y.length() - scale) > kShapeTolerance * scale ||
        std::abs(x.dotProduct(y)) > kShapeTolerance * scale * scale)
        return Hsys::eBadArgument;
    assertWriteEnabled();
    m_origin = xform * m_origin;
    m_xAxis = x / scale;
    m_yAxis = y / y.length();
    for (Vertex& vertex : m_vertices) {
        vertex.point = {vertex.point.x * scale, vertex.point.y * scale};
        if (vertex.startWidth >= 0.0)
            vertex.startWidth *= scale;
        if (vertex.endWidth >= 0.0)
            vertex.endWidth *= scale;
    }
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbEntity::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    bool closed = false;
    bool plinegen = false;
    HsGePoint3d origin;
    HsGeVector3d xAxis;
    HsGeVector3d yAxis;
    std::uint32_t count = 0;
    if (filer->readBool(closed) != Hsys::eSuccess || filer->readBool(plinegen) != Hsys::eSuccess ||
        filer->readPoint3d(origin) != Hsys::eSuccess ||
        readVector(filer, xAxis) != Hsys::eSuccess || readVector(filer, yAxis) != Hsys::eSuccess ||
        filer->readUInt32(count) != Hsys::eSuccess)
        return filer->filerStatus();
    if (!allFinite({origin.x, origin.y, origin.z}) || !isUnitSystem(xAxis, yAxis) ||
        std::size_t{count} > filer->remaining() / kVertexSize) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    std::vector<Vertex> vertices(count);
    for (Vertex& vertex : vertices) {
        if (filer->readPoint2d(vertex.point) != Hsys::eSuccess ||
            filer->readDouble(vertex.bulge) != Hsys::eSuccess ||
            filer->readDouble(vertex.startWidth) != Hsys::eSuccess ||
            filer->readDouble(vertex.endWidth) != Hsys::eSuccess)
            return filer->filerStatus();
        if (!allFinite({vertex.point.x, vertex.point.y, vertex.bulge, vertex.startWidth,
                        vertex.endWidth})) {
            filer->setFilerStatus(Hsys::eFilerError);
            return filer->filerStatus();
        }
    }
    m_closed = closed;
    m_plinegen = plinegen;
    m_origin = origin;
    m_xAxis = xAxis;
    m_yAxis = yAxis;
    m_vertices = std::move(vertices);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbPolyline::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbEntity::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeBool(m_closed);
    filer->writeBool(m_plinegen);
    filer->writePoint3d(m_origin);
    writeVector(filer, m_xAxis);
    writeVector(filer, m_yAxis);
    filer->writeUInt32(static_cast<std::uint32_t>(m_vertices.size()));
    for (const Vertex& vertex : m_vertices) {
        filer->writePoint2d(vertex.point);
        filer->writeDouble(vertex.bulge);
        filer->writeDouble(vertex.startWidth);
        filer->writeDouble(vertex.endWidth);
    }
    return filer->filerStatus();
}
