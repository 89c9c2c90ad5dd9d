// What the modeler throws when it cannot do what it was asked: a code to act on and a message to
// show.
#pragma once

#include <iosfwd>
#include <stdexcept>
#include <string>

namespace Solidra {

class ErrorCode : public std::runtime_error {
public:
    // The numbers reach other modules, which show or record them: they never change.
    enum Value : int {
        eSelfCrossing = 1,
        eBadCoordinate = 2,
        eNotPlanar = 3,
        eUnknownTriangulationType = 4,
        eNoCallback = 5,
    };

    // The message reads "eSelfCrossing (1): " followed by the detail.
    ErrorCode(Value value, const std::string& detail);

    Value value() const noexcept { return mValue; }

private:
    Value mValue;
};

// The enumerator's name, or "unknown modeler error" for a number the enum does not hold.
const char* toString(ErrorCode::Value value);

// Prints "eSelfCrossing (1)", so that a failing test names the code.
std::ostream& operator<<(std::ostream& out, ErrorCode::Value value);

// A number for an error message, with 6 significant digits, written the same in every locale.
std::string messageNumber(double value);

} // namespace Solidra
