#include "areacalc/calc/ZyrAreaCalculationWhiteBoard.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/module/ZyrAreaCalculationBaseSingletonFactory.h"
#include "areacalc/module/ZyrAreaCalculationHdxServices.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "platform/host/ut/HsutConsole.h"

#include <algorithm>
#include <string>

namespace {

const ZyrAreaCalculationWhiteBoardImp::ConfigPair kEmptyConfigPair;
const ZyrAreaCalculationWhiteBoardImp::ConfigPairVector kNoConfigurations;
const std::vector<ZyrAreaCalculationWhiteBoardImp::EvaluationDesc> kNoEvaluationDescs;
const ZyrAreaCalculationWhiteBoardImp::EvaluationDesc kEmptyEvaluationDesc{0, 0, {}, 0, 0};

// Level 0 indents like level 1.
std::wstring indentOf(int level) {
    return std::wstring(static_cast<size_t>(std::max(level, 1)), L' ');
}

int innerLevel(int level, int more) {
    return static_cast<int>(indentOf(level).size()) + more;
}

void printTitle(const wchar_t* format, const wchar_t* title) {
    if (title != nullptr)
        hsutPrintf(format, title);
}

const wchar_t* classNameOf(const HsRxClass* cls) {
    return cls != nullptr ? cls->name() : L"";
}

} // namespace

ZyrAreaCalculationWhiteBoardImp::~ZyrAreaCalculationWhiteBoardImp() = default;

void ZyrAreaCalculationWhiteBoardImp::invalidate() {
    invalidate({hsdbHostApplicationServices()->workingDatabase()});
}

void ZyrAreaCalculationWhiteBoardImp::invalidate(const std::vector<HsDbDatabase*>&) {
    m_valid = true;
}

void ZyrAreaCalculationWhiteBoardImp::reset() {
    m_databases.clear();
    m_valid = false;
}

Hsys::ErrorStatus ZyrAreaCalculationWhiteBoardImp::attachAlgorithm(HsRxClass* algorithmClass) {
    if (algorithm(algorithmClass) != nullptr)
        return Hsys::eDuplicateName;
    ZyrAreaCalculationHdxServices* services = ZyrAreaCalculationHdxServices::service();
    ZyrAreaCalculationBaseSingletonFactory* factory =
        services != nullptr ? services->algorithmFactory() : nullptr;
    if (factory == nullptr)
        return Hsys::eDoesNotApply;
    auto* attached = ZyrAreaCalculationAlgorithm::cast(factory->instance(algorithmClass));
    if (attached == nullptr)
        return Hsys::eWrongClass;
    m_algorithms.push_back(attached);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrAreaCalculationWhiteBoardImp::detachAlgorithm(HsRxClass* algorithmClass) {
    if (m_algorithms.empty())
        return Hsys::eSuccess;
    if (algorithmClass == nullptr) {
        m_algorithms.clear();
        return Hsys::eSuccess;
    }
    const auto found =
        std::find(m_algorithms.begin(), m_algorithms.end(), algorithm(algorithmClass));
    if (found == m_algorithms.end())
        return Hsys::eNameNotFound;
    m_algorithms.erase(found);
    return Hsys::eSuccess;
}

ZyrAreaCalculationAlgorithm*
ZyrAreaCalculationWhiteBoardImp::algorithm(HsRxClass* algorithmClass) const {
    const auto found = std::find_if(m_algorithms.begin(), m_algorithms.end(),
                                    [algorithmClass](const ZyrAreaCalculationAlgorithm* attached) {
                                        return attached->isA() == algorithmClass;
                                    });
    return found != m_algorithms.end() ? *found : nullptr;
}

bool ZyrAreaCalculationWhiteBoardImp::hasDispRep(HsRxClass* dispRepClass,
                                                 unsigned int& index) const {
    const auto found =
        std::find_if(m_dispReps.begin(), m_dispReps.end(), [dispRepClass](const DispRep& row) {
            return row.second.first == dispRepClass;
        });
    if (found == m_dispReps.end())
        return false;
    index = static_cast<unsigned int>(found - m_dispReps.begin());
    return true;
}

bool ZyrAreaCalculationWhiteBoardImp::hasDatabase(HsDbDatabase* database,
                                                  unsigned int& index) const {
    const auto found = std::find_if(
        m_databases.begin(), m_databases.end(),
        [database](const DatabaseEvaluationDesc& record) { return record.database == database; });
    if (found == m_databases.end())
        return false;
    index = static_cast<unsigned int>(found - m_databases.begin());
    return true;
}

const ZyrAreaCalculationWhiteBoardImp::EvaluationDesc&
ZyrAreaCalculationWhiteBoardImp::evaluationDesc(HsDbDatabase* database, HsRxClass* dispRepClass,
                                                bool& found) const {
    found = false;
    unsigned int row = 0;
    unsigned int databaseIndex = 0;
    if (database == nullptr || dispRepClass == nullptr || !hasDispRep(dispRepClass, row) ||
        !hasDatabase(database, databaseIndex))
        return kEmptyEvaluationDesc;
    for (const EvaluationDesc& record : m_databases[databaseIndex].evaluationDescs) {
        if (record.dispRepIndex == row) {
            found = true;
            return record;
        }
    }
    return kEmptyEvaluationDesc;
}

bool ZyrAreaCalculationWhiteBoardImp::hasEvaluationDesc(HsDbDatabase* database,
                                                        HsRxClass* dispRepClass) const {
    bool found = false;
    evaluationDesc(database, dispRepClass, found);
    return found;
}

const std::vector<ZyrAreaCalculationWhiteBoardImp::EvaluationDesc>&
ZyrAreaCalculationWhiteBoardImp::evaluationDescVector(HsDbDatabase* database) const {
    unsigned int index = 0;
    if (database == nullptr || !hasDatabase(database, index))
        return kNoEvaluationDescs;
    return m_databases[index].evaluationDescs;
}

void ZyrAreaCalculationWhiteBoardImp::applicableDispReps(std::vector<HsRxClass*>& classes) const {
    for (const DispRep& row : m_dispReps)
        classes.push_back(row.second.first);
}

unsigned int ZyrAreaCalculationWhiteBoardImp::currentConfigPairId(HsDbDatabase* database,
                                                                  HsRxClass* dispRepClass) const {
    bool found = false;
    const EvaluationDesc& record = evaluationDesc(database, dispRepClass, found);
    if (!found || record.currentPairId >= record.configurations.size())
        return kNoPairId;
    return record.currentPairId;
}

const ZyrAreaCalculationWhiteBoardImp::ConfigPairVector&
ZyrAreaCalculationWhiteBoardImp::configurationVector(HsDbDatabase* database,
                                                     HsRxClass* dispRepClass) const {
    bool found = false;
    const EvaluationDesc& record = evaluationDesc(database, dispRepClass, found);
    return found ? record.configurations : kNoConfigurations;
}

const ZyrAreaCalculationWhiteBoardImp::ConfigPair&
ZyrAreaCalculationWhiteBoardImp::currentConfigPair(HsDbDatabase* database,
                                                   HsRxClass* dispRepClass) const {
    const unsigned int current = currentConfigPairId(database, dispRepClass);
    if (current == kNoPairId)
        return kEmptyConfigPair;
    return configurationVector(database, dispRepClass)[current];
}

void ZyrAreaCalculationWhiteBoardImp::bitmapSize(HsDbDatabase* database, HsRxClass* dispRepClass,
                                                 unsigned int& x, unsigned int& y) const {
    x = kDefaultBitmapSize;
    y = kDefaultBitmapSize;
    bool found = false;
    const EvaluationDesc& record = evaluationDesc(database, dispRepClass, found);
    if (!found)
        return;
    x = record.bitmapWidth;
    y = record.bitmapHeight;
}

bool ZyrAreaCalculationWhiteBoardImp::isBitmapEnabled(HsRxClass* dispRepClass) const {
    unsigned int row = 0;
    return hasDispRep(dispRepClass, row) && m_dispReps[row].second.second;
}

unsigned int ZyrAreaCalculationWhiteBoardImp::colorDepth(HsDbDatabase* database) const {
    unsigned int index = 0;
    if (database == nullptr || !hasDatabase(database, index))
        return kDefaultColorDepth;
    return m_databases[index].colorDepth;
}

ZyrAreaCalculationWhiteBoardImp* ZyrAreaCalculationWhiteBoardImp::clone() const {
    auto* copy = new ZyrAreaCalculationWhiteBoardImp;
    copy->copyFrom(this);
    return copy;
}

void ZyrAreaCalculationWhiteBoardImp::copyFrom(const ZyrAreaCalculationWhiteBoardImp* other) {
    if (other == nullptr)
        return;
    m_valid = other->m_valid;
    if (other == this)
        return;
    m_dispReps = other->m_dispReps;
    m_databases = other->m_databases;
    m_algorithms = other->m_algorithms;
}

void ZyrAreaCalculationWhiteBoardImp::dump(const wchar_t* title, int level) const {
    printTitle(L"\n%s", title);
    const int inner = innerLevel(level, 2);
    dumpAlgorithms(L"Applied algorithms", inner);
    dumpDispReps(L"Used entity views", inner);
    hsutPrintf(L"\n\n%sDatabase map ", indentOf(level).c_str());
    if (m_databases.empty())
        hsutPrintf(L" is empty...\n");
    for (const DatabaseEvaluationDesc& record : m_databases)
        dumpDatabase(record, nullptr, inner);
}

void ZyrAreaCalculationWhiteBoardImp::dumpAlgorithms(const wchar_t* title, int level) const {
    printTitle(L"\n%s", title);
    const std::wstring indent = indentOf(level);
    int position = 0;
    for (const ZyrAreaCalculationAlgorithm* attached : m_algorithms)
        hsutPrintf(L"\n%s%2d. %s", indent.c_str(), position++, attached->isA()->name());
}

void ZyrAreaCalculationWhiteBoardImp::dumpDispReps(const wchar_t* title, int level) const {
    printTitle(L"\n%s", title);
    const std::wstring indent = indentOf(level);
    int position = 0;
    for (const DispRep& row : m_dispReps)
        hsutPrintf(L"\n%s%2d. %s \t\t%s", indent.c_str(), position++, classNameOf(row.first),
                   classNameOf(row.second.first));
}

void ZyrAreaCalculationWhiteBoardImp::dumpDatabase(const DatabaseEvaluationDesc& record,
                                                   const wchar_t* title, int level) const {
    printTitle(L"\n%s", title);
    const std::wstring indent = indentOf(level);
    const wchar_t* fileName = L"";
    if (record.database != nullptr && record.database->getFilename(fileName) != Hsys::eSuccess)
        fileName = L"";
    hsutPrintf(L"\n%sDatabase name   %s", indent.c_str(), fileName);
    hsutPrintf(L"\n%sColor depth     %d", indent.c_str(), static_cast<int>(record.colorDepth));
    for (const EvaluationDesc& evaluation : record.evaluationDescs)
        dumpEvaluationDesc(evaluation, nullptr, innerLevel(level, 4));
    hsutPrintf(L"\n");
}

void ZyrAreaCalculationWhiteBoardImp::dumpEvaluationDesc(const EvaluationDesc& record,
                                                         const wchar_t* title, int level) const {
    printTitle(L"\n\n%s", title);
    const std::wstring indent = indentOf(level);
    hsutPrintf(L"\n%sReferenced view index   %d", indent.c_str(),
               static_cast<int>(record.dispRepIndex));
    dumpConfigurations(record.configurations, nullptr, innerLevel(level, 4));
    hsutPrintf(L"\n%sCurrent confiuration id %d", indent.c_str(),
               static_cast<int>(record.currentPairId));
    hsutPrintf(L"\n%sBitmap sizes (x, y)     %d, %d", indent.c_str(),
               static_cast<int>(record.bitmapWidth), static_cast<int>(record.bitmapHeight));
    hsutPrintf(L"\n");
}

void ZyrAreaCalculationWhiteBoardImp::dumpConfigurations(const ConfigPairVector& configurations,
                                                         const wchar_t* title, int level) const {
    printTitle(L"\n%s", title);
    const std::wstring indent = indentOf(level);
    int position = 0;
    for (const ConfigPair& configuration : configurations)
        hsutPrintf(L"\n%s%2d. %s (%ld)", indent.c_str(), position++,
                   configuration.second.GetString(),
                   static_cast<long>(configuration.first.handle()));
}

ZyrAreaCalculationWhiteBoard::ZyrAreaCalculationWhiteBoard()
    : m_imp(new ZyrAreaCalculationWhiteBoardImp) {}

ZyrAreaCalculationWhiteBoard::~ZyrAreaCalculationWhiteBoard() {
    delete m_imp;
}

ZyrTransactable* ZyrAreaCalculationWhiteBoard::clone() const {
    return new ZyrAreaCalculationWhiteBoard(m_imp->clone());
}

void ZyrAreaCalculationWhiteBoard::copyFrom(const ZyrTransactable* other) {
    if (const auto* board = dynamic_cast<const ZyrAreaCalculationWhiteBoard*>(other))
        m_imp->copyFrom(board->m_imp);
}

void ZyrAreaCalculationWhiteBoard::validate() {
    current().invalidate();
}

void ZyrAreaCalculationWhiteBoard::validate(const std::vector<HsDbDatabase*>& databases) {
    current().invalidate(databases);
}

void ZyrAreaCalculationWhiteBoard::reset() {
    current().reset();
}

void ZyrAreaCalculationWhiteBoard::dump() const {
    current().dump(nullptr, 0);
}

ZyrAreaCalculationWhiteBoardImp* ZyrAreaCalculationWhiteBoard::imp() {
    auto* board = dynamic_cast<ZyrAreaCalculationWhiteBoard*>(instance());
    return board != nullptr ? board->m_imp : nullptr;
}

const ZyrAreaCalculationWhiteBoardImp* ZyrAreaCalculationWhiteBoard::imp() const {
    const auto* board = dynamic_cast<const ZyrAreaCalculationWhiteBoard*>(instance());
    return board != nullptr ? board->m_imp : nullptr;
}

namespace {

template <class Imp> Imp& checkedImp(Imp* imp) {
    if (imp == nullptr)
        throw HsAssertionViolation("the object in force of a white board is no white board");
    return *imp;
}

} // namespace

ZyrAreaCalculationWhiteBoardImp& ZyrAreaCalculationWhiteBoard::current() {
    return checkedImp(imp());
}

const ZyrAreaCalculationWhiteBoardImp& ZyrAreaCalculationWhiteBoard::current() const {
    return checkedImp(imp());
}

Hsys::ErrorStatus ZyrAreaCalculationWhiteBoard::attachAlgorithm(HsRxClass* algorithmClass) {
    return current().attachAlgorithm(algorithmClass);
}

Hsys::ErrorStatus ZyrAreaCalculationWhiteBoard::detachAlgorithm(HsRxClass* algorithmClass) {
    return current().detachAlgorithm(algorithmClass);
}

ZyrAreaCalculationAlgorithm*
ZyrAreaCalculationWhiteBoard::algorithm(HsRxClass* algorithmClass) const {
    return current().algorithm(algorithmClass);
}

const ZyrAreaCalculationWhiteBoardImp::AlgorithmVector&
ZyrAreaCalculationWhiteBoard::algorithmVector() const {
    return current().algorithmVector();
}

const ZyrAreaCalculationWhiteBoardImp::ConfigPair&
ZyrAreaCalculationWhiteBoard::currentConfigPair(HsDbDatabase* database,
                                                HsRxClass* dispRepClass) const {
    return current().currentConfigPair(database, dispRepClass);
}

void ZyrAreaCalculationWhiteBoard::applicableDispReps(std::vector<HsRxClass*>& classes) const {
    current().applicableDispReps(classes);
}

unsigned int ZyrAreaCalculationWhiteBoard::currentConfigPairId(HsDbDatabase* database,
                                                               HsRxClass* dispRepClass) const {
    return current().currentConfigPairId(database, dispRepClass);
}

const ZyrAreaCalculationWhiteBoardImp::ConfigPairVector&
ZyrAreaCalculationWhiteBoard::configurationVector(HsDbDatabase* database,
                                                  HsRxClass* dispRepClass) const {
    return current().configurationVector(database, dispRepClass);
}

void ZyrAreaCalculationWhiteBoard::bitmapSize(HsDbDatabase* database, HsRxClass* dispRepClass,
                                              unsigned int& x, unsigned int& y) const {
    current().bitmapSize(database, dispRepClass, x, y);
}

bool ZyrAreaCalculationWhiteBoard::isBitmapEnabled(HsRxClass* dispRepClass) const {
    return current().isBitmapEnabled(dispRepClass);
}

unsigned int ZyrAreaCalculationWhiteBoard::colorDepth(HsDbDatabase* database) const {
    return current().colorDepth(database);
}
