// Makes the preview bitmap of an object from the white board's settings and the base service.
#pragma once

#include "areacalc/calc/ZyrBitmapHandle.h"

class HsDbEntity;
class HsRxClass;
class ZyrAreaCalculationBaseService;
class ZyrAreaCalculationWhiteBoard;

class ZyrAreaCalculationBitmapCreator {
public:
    // Takes the base service of the moment; neither it nor the board is owned.
    explicit ZyrAreaCalculationBitmapCreator(const ZyrAreaCalculationWhiteBoard* board);

    // Null without entity, representation class, service or board, for a size of zero, and when
    // previews are not enabled for the representation. A service that throws std::runtime_error
    // while the board's settings are read is asked once more without a configuration.
    ZyrBitmapHandle bitmap(HsDbEntity* entity, HsRxClass* dispRepClass) const;

private:
    ZyrAreaCalculationBaseService* m_service;
    const ZyrAreaCalculationWhiteBoard* m_board;
};
