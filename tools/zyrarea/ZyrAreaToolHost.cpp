#include "tools/zyrarea/ZyrAreaToolHost.h"

#include "areacalc/calc/ZyrAreaCalculationAreaAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationPerimeterAlgorithm.h"
#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationBaseModule.h"
#include "areacalc/module/ZyrAreaCalculationBaseTexts.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrRxClassDecorator.h"

namespace {

// The tool links the module rather than loading it: this stands for the handle a loader gives.
int gModuleImage;
AFX_EXTENSION_MODULE gClientExtension;

} // namespace

ZyrAreaToolHost::ZyrAreaToolHost() {
    _hdllInstance = &gModuleImage;
    ZyrAreaCalculationBaseTexts::registerTexts();
    ZyrDecoratorManager::bindModule(_hdllInstance, ZyrAreaCalculationBaseApp::kAppName);
    ZyrDecoratorManager::registerClasses(_hdllInstance);
    m_client = std::make_unique<ZyrAppHdx>(ZyrAreaCalculationBaseApp::kAppName, _hdllInstance,
                                           gClientExtension, L"zyrarea");
    m_status = ZyrAreaCalculationHdxServices::registerService(m_client.get());
    if (m_status == Hsys::eSuccess)
        m_status = attachAlgorithms();
}

ZyrAreaToolHost::~ZyrAreaToolHost() {
    ZyrAreaCalculationHdxServices::unRegisterService(m_client.get());
}

Hsys::ErrorStatus ZyrAreaToolHost::attachAlgorithms() {
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    ZyrAreaCalculationWhiteBoard* board = services != nullptr ? services->whiteBoard() : nullptr;
    if (board == nullptr)
        return Hsys::eDoesNotApply;
    for (HsRxClass* algorithm :
         {ZyrAreaCalculationAreaAlgorithm::desc(), ZyrAreaCalculationPerimeterAlgorithm::desc()}) {
        const Hsys::ErrorStatus status = board->attachAlgorithm(algorithm);
        // A board that has the algorithm already is just as good.
        if (status != Hsys::eSuccess && status != Hsys::eDuplicateName)
            return status;
    }
    return Hsys::eSuccess;
}
