// The load guard that would convert extended data an older release attached to an object.
#pragma once

class HsDbBdfFiler;
class HsRxClass;
class HsRxObject;

// Built at the top of every bdfInFields after ZyrRegisterRelgraph, and destroyed first. Older
// releases kept some settings as extended data (application-named lists of values) on the object
// rather than in its fields, and a read of such an object moved them into the fields. Objects of
// this host carry no extended data and every stream of this format has its settings in its
// fields, so there is nothing to convert: the guard marks the one place where a conversion would
// run and does nothing else.
class ZyrConvertLegacyExtendData {
public:
    ZyrConvertLegacyExtendData(HsDbBdfFiler* filer, const HsRxObject* object, const HsRxClass* cls);
    ~ZyrConvertLegacyExtendData() = default;
    ZyrConvertLegacyExtendData(const ZyrConvertLegacyExtendData&) = delete;
    ZyrConvertLegacyExtendData& operator=(const ZyrConvertLegacyExtendData&) = delete;
};
