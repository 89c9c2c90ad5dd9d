// Decides which open drawing databases take part in the settings of calculations.
#pragma once

class HsDbDatabase;

class ZyrHsDbDatabaseValuator {
public:
    ZyrHsDbDatabaseValuator() = default;
    ZyrHsDbDatabaseValuator(const ZyrHsDbDatabaseValuator&) = delete;
    ZyrHsDbDatabaseValuator& operator=(const ZyrHsDbDatabaseValuator&) = delete;

    // The virtual operations, in the order of their slots.
    virtual bool isDatabaseValid(HsDbDatabase* database) const = 0;
    virtual ~ZyrHsDbDatabaseValuator();
};

// A database counts once its display system has been set up in it.
class ZyrHsDbDatabaseValuatorDisplaySystem : public ZyrHsDbDatabaseValuator {
public:
    bool isDatabaseValid(HsDbDatabase* database) const override;
};
