// A directed edge between two vertices of a face; its vertex is the one it starts from.
#pragma once

namespace Solidra {

class Vertex;

class Edge {
public:
    Edge(const Vertex* start, const Vertex* end) : mStart(start), mEnd(end) {}

    const Vertex* vertex() const { return mStart; }
    const Vertex* endVertex() const { return mEnd; }

private:
    const Vertex* mStart;
    const Vertex* mEnd;
};

} // namespace Solidra
