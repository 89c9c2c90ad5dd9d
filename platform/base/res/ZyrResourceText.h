// One text of a module's resources, kept between uses: code that names thousands of records with
// one text looks it up once, and again only after the resource tables changed.
#pragma once

#include "platform/base/res/ZyrRmCString.h"

#include <cstdint>

class ZyrResourceText {
public:
    // appName must outlive the object; the module's own constant name does.
    ZyrResourceText(const wchar_t* appName, unsigned int id) : m_appName(appName), m_id(id) {}

    // What ZyrRmCString(appName, id, false) gives now.
    const ZyrRmCString& text() const;

private:
    const wchar_t* m_appName;
    unsigned int m_id;
    // The tables' generation the text was taken from; none yet at zero. Kept through const
    // access, on the main thread like every resource lookup.
    mutable std::uint64_t m_generation = 0;
    mutable ZyrRmCString m_text;
};
