#include "areacalc/calc/ZyrAreaCalculationBitmapCreator.h"

#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/module/ZyrAreaCalculationBaseService.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/host/db/HsDbEntity.h"

#include <stdexcept>

namespace {

ZyrAreaCalculationBaseService* currentBaseService() {
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    return services != nullptr ? services->baseService() : nullptr;
}

} // namespace

ZyrAreaCalculationBitmapCreator::ZyrAreaCalculationBitmapCreator(
    const ZyrAreaCalculationWhiteBoard* board)
    : m_service(currentBaseService()), m_board(board) {}

ZyrBitmapHandle ZyrAreaCalculationBitmapCreator::bitmap(HsDbEntity* entity,
                                                        HsRxClass* dispRepClass) const {
    if (entity == nullptr || dispRepClass == nullptr || m_service == nullptr || m_board == nullptr)
        return nullptr;
    HsDbDatabase* database = entity->database();
    // The figures of the retry without a configuration, when the board cannot be read.
    unsigned int width = 100;
    unsigned int height = 100;
    unsigned int depth = 4;
    try {
        const ZyrAreaCalculationWhiteBoardImp::ConfigPair& pair =
            m_board->currentConfigPair(database, dispRepClass);
        m_board->bitmapSize(database, dispRepClass, width, height);
        if (width == 0 || height == 0 || !m_board->isBitmapEnabled(dispRepClass))
            return nullptr;
        depth = m_board->colorDepth(database);
        return m_service->bitmap(entity, pair.first, width, height, depth);
    } catch (const std::runtime_error&) {
        return m_service->bitmap(entity, HsDbObjectId::kNull, width, height, depth);
    } catch (...) {
        return nullptr;
    }
}
