// One reported change of a parameter: its number, the class that numbers it and the object.
#pragma once

#include "platform/base/obj/ZyrParamChangeFlag.h"

class HsRxClass;
class HsRxObject;

// A parameter is named by its number within a class, so that a change deep inside an object (a
// node of a tree) and the change of the record that holds it can be told apart. The object is
// not owned; it is whoever changed, and may be null.
class ZyrParamInfo {
public:
    ZyrParamInfo(int paramId, HsRxClass* paramClass, HsRxObject* object,
                 ZyrParamChangeFlag::Type flags = ZyrParamChangeFlag::kAll)
        : m_paramId(paramId), m_paramClass(paramClass), m_object(object), m_flags(flags) {}

    int paramId() const { return m_paramId; }
    HsRxClass* paramClass() const { return m_paramClass; }
    HsRxObject* object() const { return m_object; }
    ZyrParamChangeFlag::Type flags() const { return m_flags; }

private:
    int m_paramId;
    HsRxClass* m_paramClass;
    HsRxObject* m_object;
    ZyrParamChangeFlag::Type m_flags;
};
