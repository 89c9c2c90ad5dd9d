#include "areacalc/calc/ZyrAreaCalculationWhiteBoardPtr.h"

#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/calc/ZyrHsDbDatabaseValuator.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"

#include <stdexcept>

ZyrAreaCalculationWhiteBoardPtr::ZyrAreaCalculationWhiteBoardPtr() {
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    if (services == nullptr)
        return;
    ZyrAreaCalculationWhiteBoard* board = services->whiteBoard();
    ZyrAreaCalculationBaseService* baseService = services->baseService();
    if (board == nullptr || baseService == nullptr)
        return;
    m_board = board;
    ZyrAreaCalculationBaseService::DatabaseInfoVector infos;
    // Whatever the service reports, the databases it listed are the ones refreshed.
    (void)baseService->getOpenDatabaseInfo(infos, true, ZyrHsDbDatabaseValuatorDisplaySystem());
    std::vector<HsDbDatabase*> databases;
    for (const auto& info : infos)
        databases.push_back(info.first);
    board->imp()->invalidate(databases);
}

ZyrAreaCalculationWhiteBoardPtr::~ZyrAreaCalculationWhiteBoardPtr() {
    if (m_board != nullptr)
        m_board->imp()->setValid(false);
}

ZyrAreaCalculationWhiteBoard* ZyrAreaCalculationWhiteBoardPtr::operator->() const {
    if (m_board == nullptr)
        throw std::runtime_error("White board auto pointer failed.");
    return m_board;
}
