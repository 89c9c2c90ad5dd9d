#include "areacalc/modifiers/ZyrDbAreaModifier.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrCollectionFiler.h"
#include "platform/base/app/ZyrHdxEquipment.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <algorithm>
#include <cstdint>
#include <cwchar>

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpAreaModifier, ZyrImpDictRecord, ZyrImpAreaModifier::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpAreaModifier>, ZyrRxClassDecorator::kNoText,
                            ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbAreaModifier, ZyrDbDictRecord, L"ZYR_ZYRDBAREAMODIFIER",
                                  28990, 28961)

namespace {

// Texts of the module's resource.
constexpr unsigned int kFormulaLabel = 29014;
constexpr unsigned int kParametersLabel = 29025;
constexpr unsigned int kAreaValueWord = 29050;

// Stands for the area value's name while the parameters are written in, so that no parameter
// whose name is a part of it can touch it.
constexpr const wchar_t* kProtectingLiteral = L"\u00B0\u00B0\u00B0\u00B0\u00B0\u00B0";

// Group codes of the old text stream.
constexpr int kFormulaGroup = 1;
constexpr int kParameterNameGroup = 2;
constexpr int kAlgorithmClassGroup = 3;
constexpr int kParameterValueGroup = 40;

// The smallest a filed parameter can be: an empty name and its value.
constexpr std::size_t kMinFiledParameterSize = HsDbBdfFiler::kMinStringSize + sizeof(double);

ZyrRmCString text(unsigned int id) {
    return ZyrAreaCalculationBaseApp::sStringFromResource(id, false);
}

ZyrRmCString hardCodedValueName() {
    std::wstring name;
    ZyrParametricExpressionHandler::getHardCodedValueName(name);
    return ZyrRmCString(name.c_str());
}

bool compareParameterPairVectorItem(const ZyrExpressionHandler::ParameterPair& a,
                                    const ZyrExpressionHandler::ParameterPair& b) {
    return std::wcscmp(a.first, b.first) < 0;
}

// What the old text stream collects before it is put together.
struct QuillonFields {
    std::vector<ZyrRmCString> names;
    std::vector<double> values;
    std::vector<HsRxClass*> classes;
};

} // namespace

// ---- ZyrImpAreaModifier ----

ZyrImpAreaModifier::ZyrImpAreaModifier() {
    m_expressionHandler.setExpression(hardCodedValueName());
    std::vector<HsRxClass*> available;
    ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(available);
    // One by one, so that the list keeps the order in which the application offers them.
    for (HsRxClass* cls : available)
        (void)m_algorithms.add(cls);
}

ZyrImpAreaModifier::~ZyrImpAreaModifier() = default;

Hsys::ErrorStatus ZyrImpAreaModifier::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpDictRecord::copyFrom(other);
        status != Hsys::eSuccess)
        return status;
    ZyrImpAreaModifier* source = ZyrImpAreaModifier::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    static_cast<ZyrExpressionHandler&>(m_expressionHandler) = source->m_expressionHandler;
    m_expressionHandler.setParameterValue(source->m_expressionHandler.parameterValue());
    m_algorithms.clear();
    // Through the source's writable access, as the record has always done: the source must be
    // open for write too.
    return m_algorithms.add(source->algorithms().items());
}

Hsys::ErrorStatus ZyrImpAreaModifier::bdfInFields(HsDbBdfFiler* filer) {
    return bdfInThisLevel(filer, [&] { return bdfInModifierFields(filer); });
}

Hsys::ErrorStatus ZyrImpAreaModifier::bdfOutFields(HsDbBdfFiler* filer) const {
    return bdfOutThisLevel(filer, [&] { return bdfOutModifierFields(filer); });
}

Hsys::ErrorStatus ZyrImpAreaModifier::bdfOutModifierFields(HsDbBdfFiler* filer) const {
    Zyr::bdfWriteItem(filer, expression());
    filer->writeUInt32(static_cast<std::uint32_t>(parameterPairVector().size()));
    for (const auto& [name, value] : parameterPairVector()) {
        Zyr::bdfWriteItem(filer, name);
        filer->writeDouble(value);
    }
    return ZyrCollectionFiler::bdfWriteTranslated(filer, ZyrCollectionFiler::RxClassAsString{},
                                                  m_algorithms);
}

// Everything is read before anything is stored, so that a short or damaged stream leaves the
// record as it was.
Hsys::ErrorStatus ZyrImpAreaModifier::bdfInModifierFields(HsDbBdfFiler* filer) {
    ZyrRmCString formula;
    if (const Hsys::ErrorStatus status = Zyr::bdfReadItem(filer, formula); status != Hsys::eSuccess)
        return status;
    std::uint32_t count = 0;
    if (filer->readUInt32(count) != Hsys::eSuccess)
        return filer->filerStatus();
    if (count > filer->remaining() / kMinFiledParameterSize) {
        filer->setFilerStatus(Hsys::eFilerError);
        return Hsys::eFilerError;
    }
    ParameterPairVector parameters(count);
    for (auto& [name, value] : parameters) {
        if (const Hsys::ErrorStatus status = Zyr::bdfReadItem(filer, name);
            status != Hsys::eSuccess)
            return status;
        if (filer->readDouble(value) != Hsys::eSuccess)
            return filer->filerStatus();
    }
    AlgorithmCollection algorithms;
    if (const Hsys::ErrorStatus status = ZyrCollectionFiler::bdfReadTranslated(
            filer, ZyrCollectionFiler::RxClassAsString{}, algorithms);
        status != Hsys::eSuccess)
        return status;
    // A filed record is taken as it stands: no change is reported and duplicates stay.
    m_expressionHandler.setExpression(formula);
    m_expressionHandler.removeAll();
    for (const auto& [name, value] : parameters)
        m_expressionHandler.addParameter(name, value);
    m_algorithms = std::move(algorithms);
    m_cacheValid = false;
    return Hsys::eSuccess;
}

void ZyrImpAreaModifier::summaryInfo(ZyrDesc* desc) const {
    ZyrImpDictRecord::summaryInfo(desc);
    ZyrAreaCalculationAlgorithm::summaryAlgorithms(desc, m_algorithms.items());
    ParameterPairVector sorted = parameterPairVector();
    std::stable_sort(sorted.begin(), sorted.end(), compareParameterPairVectorItem);
    desc->addCount(text(kParametersLabel), static_cast<long long>(sorted.size()));
    for (const auto& [name, value] : sorted)
        desc->addDistance(name, -1, -1, value);
    ZyrRmCString formula = expression();
    ZyrHdxEquipment::multipleSubst(formula, hardCodedValueName(), text(kAreaValueWord));
    desc->addText(text(kFormulaLabel), formula);
}

Hsys::ErrorStatus ZyrImpAreaModifier::evaluateExpr(double value, double& result) const {
    if (!m_cacheValid) {
        if (!m_cache.empty())
            m_cache.clear();
        m_cacheValid = true;
    }
    if (!m_cache.empty() && m_cache.has(value)) {
        result = m_cache[value];
        return Hsys::eSuccess;
    }
    m_expressionHandler.setParameterValue(value);
    if (const Hsys::ErrorStatus status = m_expressionHandler.evaluate(result);
        status != Hsys::eSuccess)
        return status;
    m_cache[value] = result;
    result = m_cache[value];
    return Hsys::eSuccess;
}

const ZyrImpAreaModifier::ParameterPairVector& ZyrImpAreaModifier::parameterPairVector() const {
    return m_expressionHandler.parameterPairVector();
}

const ZyrRmCString& ZyrImpAreaModifier::expression() const {
    return m_expressionHandler.expression();
}

void ZyrImpAreaModifier::beginFormulaChange(ParameterId changed) {
    assertParentWriteEnabled();
    recordParameterChanged(changed, ZyrDbAreaModifier::desc(), ZyrParamChangeFlag::kAll, this);
    m_cacheValid = false;
}

void ZyrImpAreaModifier::beginAlgorithmChange() {
    assertParentWriteEnabled();
    recordParameterChanged(kAlgorithmsChanged, ZyrDbAreaModifier::desc(), ZyrParamChangeFlag::kAll,
                           nullptr);
}

Hsys::ErrorStatus ZyrImpAreaModifier::setExpression(const ZyrRmCString& text) {
    if (text == expression())
        return Hsys::eSuccess;
    beginFormulaChange(kFormulaChanged);
    m_expressionHandler.setExpression(text);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaModifier::addParameter(const ZyrRmCString& name, double value) {
    if (m_expressionHandler.has(name))
        return Hsys::eDuplicateName;
    beginFormulaChange(kParametersChanged);
    m_expressionHandler.addParameter(name, value);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaModifier::removeParameter(const ZyrRmCString& name) {
    if (!m_expressionHandler.has(name))
        return Hsys::eNameNotFound;
    beginFormulaChange(kParametersChanged);
    m_expressionHandler.removeParameter(name);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaModifier::renameParameterName(const ZyrRmCString& oldName,
                                                          const ZyrRmCString& newName) {
    if (oldName == newName)
        return Hsys::eSuccess;
    const ParameterPairVector& parameters = parameterPairVector();
    const auto found =
        std::find_if(parameters.begin(), parameters.end(),
                     [&](const auto& parameter) { return parameter.first == oldName; });
    if (found == parameters.end()) {
        m_cacheValid = false;
        return Hsys::eNameNotFound;
    }
    const double value = found->second;
    beginFormulaChange(kParametersChanged);
    m_expressionHandler.removeParameter(oldName);
    m_expressionHandler.addParameter(newName, value);
    return Hsys::eSuccess;
}

void ZyrImpAreaModifier::partialReplacedExpression(ZyrRmCString& result) const {
    const ZyrRmCString valueName = hardCodedValueName();
    ZyrRmCString protectedText = expression();
    ZyrHdxEquipment::multipleSubst(protectedText, valueName, kProtectingLiteral);
    m_expressionHandler.ZyrExpressionHandler::expand(protectedText, parameterPairVector(), result,
                                                     ZyrExpressionHandler::defaultFormatCB,
                                                     nullptr);
    ZyrHdxEquipment::multipleSubst(result, kProtectingLiteral, valueName);
}

void ZyrImpAreaModifier::fullyReplacedExpression(double value, ZyrRmCString& result) const {
    const double bound = m_expressionHandler.parameterValue();
    m_expressionHandler.setParameterValue(value);
    m_expressionHandler.expand(result, ZyrExpressionHandler::defaultFormatCB, nullptr);
    m_expressionHandler.setParameterValue(bound);
}

const ZyrImpAreaModifier::AlgorithmCollection& ZyrImpAreaModifier::algorithms() const {
    return m_algorithms;
}

ZyrImpAreaModifier::AlgorithmCollection& ZyrImpAreaModifier::algorithms() {
    assertParentWriteEnabled();
    return m_algorithms;
}

Hsys::ErrorStatus ZyrImpAreaModifier::addAlgorithm(HsRxClass* cls) {
    if (cls == nullptr)
        return Hsys::eBadArgument;
    if (m_algorithms.contains(cls))
        return Hsys::eDuplicateName;
    beginAlgorithmChange();
    return m_algorithms.add(cls);
}

Hsys::ErrorStatus ZyrImpAreaModifier::removeAlgorithm(HsRxClass* cls) {
    if (cls == nullptr)
        return Hsys::eBadArgument;
    if (!m_algorithms.contains(cls))
        return Hsys::eNameNotFound;
    beginAlgorithmChange();
    // The collection has no removal of its own; the rest is appended again in its order.
    std::vector<HsRxClass*> kept = m_algorithms.items();
    kept.erase(std::find(kept.begin(), kept.end(), cls));
    m_algorithms.clear();
    for (HsRxClass* held : kept)
        (void)m_algorithms.add(held);
    return Hsys::eSuccess;
}

const ZyrRmCStringArray& ZyrImpAreaModifier::algorithmClassNames() const {
    static const ZyrRmCStringArray kNoNames;
    return kNoNames;
}

namespace {

// One group of the old stream into fields (the formula straight into handler); eEndOfInput, with
// the group pushed back, for a group code the stream does not know; eWrongType for a value of
// another type than its code has.
Hsys::ErrorStatus readQuillonGroup(HsDbTdfFiler* filer, const HsDbTdfItem& item,
                                   ZyrParametricExpressionHandler& handler, QuillonFields& fields) {
    const int code = item.groupCode();
    if (code == kParameterValueGroup) {
        double value = 0.0;
        const Hsys::ErrorStatus status = item.getReal(value);
        if (status == Hsys::eSuccess)
            fields.values.push_back(value);
        return status;
    }
    if (code != kFormulaGroup && code != kParameterNameGroup && code != kAlgorithmClassGroup) {
        filer->pushBackItem();
        return Hsys::eEndOfInput;
    }
    std::wstring text;
    if (const Hsys::ErrorStatus status = item.getText(text); status != Hsys::eSuccess)
        return status;
    if (code == kFormulaGroup)
        handler.setExpression(ZyrRmCString(std::move(text)));
    else if (code == kParameterNameGroup)
        fields.names.emplace_back(std::move(text));
    else
        fields.classes.push_back(Zyr::classNameToClass(text.c_str()));
    return Hsys::eSuccess;
}

} // namespace

Hsys::ErrorStatus ZyrImpAreaModifier::tdfInFieldsQuillon(HsDbTdfFiler* filer) {
    assertParentWriteEnabled();
    m_expressionHandler.setExpression(ZyrRmCString());
    m_expressionHandler.removeAll();
    m_algorithms.clear();
    QuillonFields fields;
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (HsDbTdfItem item; status == Hsys::eSuccess;) {
        status = filer->readItem(item);
        if (status == Hsys::eSuccess)
            status = readQuillonGroup(filer, item, m_expressionHandler, fields);
    }
    m_algorithms.add(fields.classes);
    const std::size_t pairs = std::min(fields.names.size(), fields.values.size());
    for (std::size_t i = 0; i < pairs; ++i)
        m_expressionHandler.addParameter(fields.names[i], fields.values[i]);
    m_cacheValid = false;
    // The end of the stream and a foreign group both end the read as the filer sees it.
    return status == Hsys::eEndOfInput ? filer->filerStatus() : status;
}

// ---- ZyrDbAreaModifier ----

void ZyrDbAreaModifier::getHardCodedValueName(std::wstring& name) {
    ZyrParametricExpressionHandler::getHardCodedValueName(name);
}

const ZyrImpAreaModifier& ZyrDbAreaModifier::readImp() const {
    assertReadEnabled();
    if (areaModifierImp() == nullptr)
        throw HsAssertionViolation("ZyrDbAreaModifier has no ZyrImpAreaModifier");
    return *areaModifierImp();
}

ZyrImpAreaModifier& ZyrDbAreaModifier::writeImp() {
    if (areaModifierImp() == nullptr)
        throw HsAssertionViolation("ZyrDbAreaModifier has no ZyrImpAreaModifier");
    return *areaModifierImp();
}

Hsys::ErrorStatus ZyrDbAreaModifier::evaluateExpr(double value, double& result) const {
    return readImp().evaluateExpr(value, result);
}

const ZyrDbAreaModifier::ParameterPairVector& ZyrDbAreaModifier::parameterPairVector() const {
    return readImp().parameterPairVector();
}

const ZyrRmCString& ZyrDbAreaModifier::expression() const {
    return readImp().expression();
}

Hsys::ErrorStatus ZyrDbAreaModifier::setExpression(const ZyrRmCString& text) {
    return writeImp().setExpression(text);
}

Hsys::ErrorStatus ZyrDbAreaModifier::addParameter(const ZyrRmCString& name, double value) {
    return writeImp().addParameter(name, value);
}

Hsys::ErrorStatus ZyrDbAreaModifier::removeParameter(const ZyrRmCString& name) {
    return writeImp().removeParameter(name);
}

Hsys::ErrorStatus ZyrDbAreaModifier::renameParameterName(const ZyrRmCString& oldName,
                                                         const ZyrRmCString& newName) {
    return writeImp().renameParameterName(oldName, newName);
}

void ZyrDbAreaModifier::partialReplacedExpression(ZyrRmCString& result) const {
    readImp().partialReplacedExpression(result);
}

void ZyrDbAreaModifier::fullyReplacedExpression(double value, ZyrRmCString& result) const {
    readImp().fullyReplacedExpression(value, result);
}

const ZyrDbAreaModifier::AlgorithmCollection& ZyrDbAreaModifier::algorithms() const {
    return readImp().algorithms();
}

ZyrDbAreaModifier::AlgorithmCollection& ZyrDbAreaModifier::algorithms() {
    return writeImp().algorithms();
}

Hsys::ErrorStatus ZyrDbAreaModifier::addAlgorithm(HsRxClass* cls) {
    return writeImp().addAlgorithm(cls);
}

Hsys::ErrorStatus ZyrDbAreaModifier::removeAlgorithm(HsRxClass* cls) {
    return writeImp().removeAlgorithm(cls);
}

const ZyrRmCStringArray& ZyrDbAreaModifier::algorithmClassNames() const {
    return readImp().algorithmClassNames();
}

ZyrRmCString ZyrDbAreaModifier::description() const {
    return readImp().description();
}
