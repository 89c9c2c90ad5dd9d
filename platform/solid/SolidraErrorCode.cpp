// Names of the modeler's error codes.
#include "platform/solid/SolidraErrorCode.h"

#include <charconv>
#include <ostream>

namespace Solidra {

namespace {

std::string describe(ErrorCode::Value value) {
    return std::string(toString(value)) + " (" + std::to_string(static_cast<int>(value)) + ")";
}

} // namespace

ErrorCode::ErrorCode(Value value, const std::string& detail)
    : std::runtime_error(describe(value) + ": " + detail), mValue(value) {}

const char* toString(ErrorCode::Value value) {
    switch (value) {
    case ErrorCode::eSelfCrossing:
        return "eSelfCrossing";
    case ErrorCode::eBadCoordinate:
        return "eBadCoordinate";
    case ErrorCode::eNotPlanar:
        return "eNotPlanar";
    case ErrorCode::eUnknownTriangulationType:
        return "eUnknownTriangulationType";
    case ErrorCode::eNoCallback:
        return "eNoCallback";
    }
    return "unknown modeler error";
}

std::ostream& operator<<(std::ostream& out, ErrorCode::Value value) {
    return out << describe(value);
}

std::string messageNumber(double value) {
    char text[32];
    const auto written =
        std::to_chars(text, text + sizeof text, value, std::chars_format::general, 6);
    return std::string(text, written.ptr);
}

} // namespace Solidra
