// An implementation object that an entity holds in its override list: data that changes how the
// entity is calculated or shown, filed with the entity.
#pragma once

#include "platform/base/obj/ZyrImpObj.h"

class ZyrParamInfo;

// Its parent is the entity that holds it. Binary filing after ZyrImpObj's: int16 80.
class ZyrOverride : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrOverride)

public:
    ZyrOverride();
    ~ZyrOverride() override;

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

    // A new description of a change of parameter paramId, owned by the caller; a null class or
    // object stands for the override's own.
    virtual ZyrParamInfo* getParamInfo(int paramId, HsRxClass* paramClass,
                                       HsRxObject* object) const;
};
