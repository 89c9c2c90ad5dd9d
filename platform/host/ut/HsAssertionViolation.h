// The one exception the platform throws: a broken precondition of the object protocol, such as
// writing to an object that is not open for write. Tests catch it; the module never does.
#pragma once

#include <stdexcept>
#include <string>

class HsAssertionViolation : public std::logic_error {
public:
    explicit HsAssertionViolation(const std::string& what) : std::logic_error(what) {}
};
