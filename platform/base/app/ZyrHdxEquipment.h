// Static helpers the sibling modules share for texts and objects.
#pragma once

class ZyrRmCString;

class ZyrHdxEquipment {
public:
    ZyrHdxEquipment() = delete;

    // Replaces every occurrence of `from` in `text` by `to`, from left to right. Inserted text is
    // not searched again, so `to` may contain `from`; an empty `from` changes nothing.
    static void multipleSubst(ZyrRmCString& text, const ZyrRmCString& from, const ZyrRmCString& to);
};
