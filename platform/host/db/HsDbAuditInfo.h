// What an audit found and fixed, and the lines it printed.
#pragma once

#include <string>
#include <vector>

class HsDbObject;

// Counts grow by what the audited objects report; whether they may repair is fixed when the audit
// starts. Every line goes to the host's console and is kept.
class HsDbAuditInfo {
public:
    explicit HsDbAuditInfo(bool fixErrors = false) : m_fixErrors(fixErrors) {}

    bool fixErrors() const { return m_fixErrors; }
    // Adds to the counts; a count below one adds nothing.
    void errorsFound(int count);
    void errorsFixed(int count);
    int numErrors() const { return m_numErrors; }
    int numFixes() const { return m_numFixes; }

    // One line: the object, the value found, what is wrong with it, and what it became or would
    // become: "HsDbLayerTableRecord(7)  owner 99  has no object  cleared".
    void printError(const HsDbObject* object, const wchar_t* value, const wchar_t* validation,
                    const wchar_t* defaultValue);
    // The same with a name of the caller's choosing in place of the object.
    void printError(const wchar_t* name, const wchar_t* value, const wchar_t* validation,
                    const wchar_t* defaultValue);
    void printInfo(const wchar_t* text);

    const std::vector<std::wstring>& lines() const { return m_lines; }

private:
    void print(std::wstring line);

    bool m_fixErrors;
    int m_numErrors = 0;
    int m_numFixes = 0;
    std::vector<std::wstring> m_lines;
};
