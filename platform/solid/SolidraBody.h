// A body: the owner of the faces built into it. Deleting the body deletes them.
#pragma once

#include "platform/solid/SolidraEntity.h"

#include <vector>

namespace Solidra {

class Face;

class Body : public Entity {
public:
    Body() = default;
    ~Body() override;

    int faceCount() const { return static_cast<int>(mFaces.size()); }

    // The faces in the order they were built; null out of range.
    Face* face(int index) const;

private:
    // Only a face joins or leaves a body: when it is built into it and when it is deleted.
    friend class Face;
    void adopt(Face* face);
    void release(Face* face);

    std::vector<Face*> mFaces;
};

} // namespace Solidra
