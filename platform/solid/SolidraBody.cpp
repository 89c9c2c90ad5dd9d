// A body's faces: joined when built, left when deleted, deleted with the body.
#include "platform/solid/SolidraBody.h"

#include "platform/solid/SolidraFace.h"

#include <algorithm>

namespace Solidra {

Body::~Body() {
    // Emptied first, so that each face's release finds nothing to remove.
    std::vector<Face*> faces;
    faces.swap(mFaces);
    for (Face* face : faces)
        delete face;
}

Face* Body::face(int index) const {
    if (index < 0 || index >= faceCount())
        return nullptr;
    return mFaces[static_cast<std::size_t>(index)];
}

void Body::adopt(Face* face) {
    mFaces.push_back(face);
}

void Body::release(Face* face) {
    const auto found = std::find(mFaces.begin(), mFaces.end(), face);
    if (found != mFaces.end())
        mFaces.erase(found);
}

} // namespace Solidra
