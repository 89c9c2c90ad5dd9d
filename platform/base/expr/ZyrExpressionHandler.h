// A formula text with ordered named parameters: evaluates it, and writes it out with the
// parameters' numbers in place of their names.
//
// Grammar of formula texts (EBNF; blanks - space, tab, CR, LF - may stand between any two tokens):
//
//   formula    = expression ;
//   expression = term { ( "+" | "-" ) term } ;           left-associative, lowest precedence
//   term       = power { ( "*" | "/" ) power } ;          left-associative
//   power      = unary [ "^" power ] ;                    right-associative: 2^3^2 is 2^9
//   unary      = { "-" } primary ;                        any number of minus signs
//   primary    = number | call | name | "(" expression ")" ;
//   call       = name "(" [ expression { "," expression } ] ")" ;
//   number     = ( digits [ "." { digit } ] | "." digits ) [ ( "e" | "E" ) [ "+" | "-" ] digits ] ;
//   digits     = digit { digit } ;
//   name       = word { " " { " " } word } ;              spaces inside are part of the name
//   word       = letter { letter | digit } ;
//   letter     = "A".."Z" | "a".."z" | "_" | U+00A1..U+10FFFF except the surrogates ;
//
// - Unary minus binds tighter than "^": -2^2 is 4, 2^-2 is 0.25. A negative number substituted
//   as text for a name ("%f" of the area value, or an expansion) thus means the same as the
//   value in parentheses wherever it lands: "x^2" with x = -2 becomes "-2^2", which is 4, and
//   "5-x" with x = -3 becomes "5--3", which is 8. Write -(2^2) for the negated power.
// - Numbers are read as "%f" writes them ("12.500000") and as defaultFormatCB writes them
//   ("0.30000000000000004", "1e-07"), with "." as the decimal point under every locale, to the
//   nearest double; a number beyond the range of a double is refused. There is no unary plus,
//   and a number run into a letter, digit or second point ("2a", "1.2.3") is an error, not a
//   number followed by a name.
// - A name is matched against the parameters exactly, case and inner spaces included: "room
//   height" is one name, "_AREA_VALUE_" is one name, "x1" is a name while "1x" is malformed.
//   A name followed by "(" is a call. The first parameter of a name binds it; a parameter
//   named "pi" hides the constant. A parameter whose name is not a name of this grammar
//   ("a-b", "", "2x") can never be referred to.
// - Functions, lower case only, angles in radians: sqrt, sin, cos, tan, atan, abs of one
//   argument; min and max of two or more. Constant: pi.
// - Parentheses, calls and chained powers nest at most 100 deep.
//
// A formula is refused with a status and a message naming the position (characters counted
// from 1): eInvalidInput for text that does not parse, nesting that is too deep, division by
// zero and every result that is not finite; eNameNotFound for an unknown parameter or function;
// eBadArgument for a wrong number of arguments. The first fault from the left is the one named.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <utility>
#include <vector>

class ZyrExpressionHandler {
public:
    using ParameterPair = std::pair<ZyrRmCString, double>;
    using ParameterPairVector = std::vector<ParameterPair>;
    // Writes `value` into `text` (replacing what it held); `data` is the caller's context.
    using FormatCallback = void (*)(double value, ZyrRmCString& text, void* data);

    ZyrExpressionHandler() = default;
    // Copies text and parameters; the last error belongs to the evaluations of the source alone.
    ZyrExpressionHandler(const ZyrExpressionHandler& other);
    ZyrExpressionHandler& operator=(const ZyrExpressionHandler& other);

    // The virtual operations, in the order of their slots. A derived handler that binds more
    // values (by substituting text first) overrides the two operations on its own text, and
    // reaches the text forms below with a qualified call or a using-declaration.
    virtual ~ZyrExpressionHandler();
    [[nodiscard]] virtual Hsys::ErrorStatus evaluate(double& result) const;
    virtual void expand(ZyrRmCString& result, FormatCallback formatCB, void* data) const;

    void setExpression(const ZyrRmCString& expression) { m_expression = expression; }
    const ZyrRmCString& expression() const { return m_expression; }

    // Parameters keep the order they were added in. Names are not checked for duplicates here:
    // a record read from a file is taken as it stands, and the first of a name binds it.
    void addParameter(const ZyrRmCString& name, double value);
    // Removes the first parameter of the name; false if there is none.
    bool removeParameter(const ZyrRmCString& name);
    void removeAll();
    bool has(const ZyrRmCString& name) const;
    const ParameterPairVector& parameterPairVector() const { return m_parameters; }
    // Values are the input of an evaluation, not part of the formula: they are bound on a handler
    // reached through a const path too, a shared pattern or a record open for read. An index out
    // of range changes nothing and answers eInvalidIndex.
    Hsys::ErrorStatus setParameterValue(int index, double value) const;

    // `text` with `parameters` bound by name. On failure `result` is left as it was and
    // lastError() tells why and where.
    [[nodiscard]] Hsys::ErrorStatus
    evaluate(const ZyrRmCString& text, const ParameterPairVector& parameters, double& result) const;
    // `text` with every whole name of a parameter replaced by its value as formatCB writes it (the
    // default format when formatCB is null). Everything else is copied as it stands, so parts of
    // longer names, digits of numbers and names of called functions are never touched, and text
    // that does not parse is expanded as far as it has names. Evaluating the result gives the
    // same value as evaluating `text` when the format reads back exactly, as the default does.
    void expand(const ZyrRmCString& text, const ParameterPairVector& parameters,
                ZyrRmCString& result, FormatCallback formatCB, void* data) const;

    // The standard number format of formula texts: the shortest digits that read back to the very
    // same double, plain for magnitudes from 0.00001 up to below 10^16 ("12.5", "-3",
    // "0.30000000000000004", "1000000000000000"), scientific outside ("1e-07", "1.5e+20"), and
    // "-0" for negative zero. Never a decimal comma. Non-finite values come out as "inf", "-inf"
    // or "nan", which no formula accepts. `data` is not used.
    static void defaultFormatCB(double value, ZyrRmCString& text, void* data);

    // Why the last evaluation failed, with the position; empty after a success.
    const ZyrRmCString& lastError() const { return m_lastError; }

private:
    ZyrRmCString m_expression;
    mutable ParameterPairVector m_parameters;
    mutable ZyrRmCString m_lastError;
};
