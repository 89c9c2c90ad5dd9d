// Area modifiers: named dictionary records holding a formula over an area value, its named
// parameters and the calculation algorithms it acts on.
#pragma once

#include "areacalc/modifiers/ZyrParametricExpressionHandler.h"
#include "areacalc/objects/ZyrDbPair.h"
#include "areacalc/objects/ZyrImpPair.h"
#include "areacalc/objects/ZyrUniqueCollectionAggregate.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/obj/ZyrImpDictRecord.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/base/zyrtl/zyrtlCache.h"

#include <string>

class HsDbTdfFiler;
class HsRxClass;

// The data of a modifier. A new record has the formula "_AREA_VALUE_", no parameters, and acts on
// every algorithm the running application offers: it leaves every value as it is.
//
// Results are cached by input value (200 entries, tolerance-equal keys, most recently used first).
// A change of formula or parameters only marks the cache stale; the next evaluation empties it.
// The algorithm list plays no part in a result, so changing it keeps the cache.
//
// Binary filing after ZyrImpDictRecord's: int16 80, the formula, a uint32 parameter count, each
// parameter's name and value, then the algorithms as a uint32 count and their class names.
class ZyrImpAreaModifier : public ZyrImpPair<ZyrImpAreaModifier, ZyrImpDictRecord> {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrImpAreaModifier)

public:
    using ParameterPairVector = ZyrExpressionHandler::ParameterPairVector;
    using AlgorithmCollection = ZyrUniqueCollectionAggregate<HsRxClass*>;
    using ResultCache =
        zyrtl::cache<double, double, zyrtl::default_value<double, double>, zyrtl::equal_to<double>>;

    static constexpr unsigned kCacheSize = 200;
    // What recordParameterChanged reports as changed.
    enum ParameterId : int { kFormulaChanged = 0, kParametersChanged = 1, kAlgorithmsChanged = 2 };

    ZyrImpAreaModifier();
    ~ZyrImpAreaModifier() override;

    // The virtual operations, in the order of their slots.
    // The record's base part (its failure returned), eBadArgument for a source that is no
    // modifier; then formula, parameters, bound value and algorithms. The cache is kept as it
    // was: a copy answers with its former results until something marks them stale. Asserts
    // write on the source as well, whose algorithm list is taken through its writable access.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // The algorithms, the parameters by name, their count, and the formula with the area value
    // in the user's words.
    void summaryInfo(ZyrDesc* desc) const override;

    // The formula over value. A hit in the cache answers without evaluating; a failure returns
    // the evaluator's status, leaves result as the evaluator left it and caches nothing.
    [[nodiscard]] Hsys::ErrorStatus evaluateExpr(double value, double& result) const;

    const ParameterPairVector& parameterPairVector() const;
    const ZyrRmCString& expression() const;
    // The same text: eSuccess and nothing else.
    Hsys::ErrorStatus setExpression(const ZyrRmCString& text);
    // eDuplicateName for a name that is there.
    Hsys::ErrorStatus addParameter(const ZyrRmCString& name, double value);
    // eNameNotFound for a name that is not there.
    Hsys::ErrorStatus removeParameter(const ZyrRmCString& name);
    // The renamed parameter moves to the end of the list with its value. The formula is not
    // rewritten and a parameter already called newName is not looked for. eNameNotFound for a
    // missing oldName, which still marks the cache stale.
    Hsys::ErrorStatus renameParameterName(const ZyrRmCString& oldName, const ZyrRmCString& newName);

    // The formula with the parameters written in by the default format and the area value still
    // under its name, for showing a modifier beside a calculated value.
    void partialReplacedExpression(ZyrRmCString& result) const;
    // The formula as a pure number text, with value for the area value. The bound value and the
    // cache stay as they were.
    void fullyReplacedExpression(double value, ZyrRmCString& result) const;

    const AlgorithmCollection& algorithms() const;
    // Asserts write: whoever takes this access may change the list.
    AlgorithmCollection& algorithms();
    // eBadArgument for null, eDuplicateName for a class that is there.
    Hsys::ErrorStatus addAlgorithm(HsRxClass* cls);
    // eBadArgument for null, eNameNotFound for a class that is not there.
    Hsys::ErrorStatus removeAlgorithm(HsRxClass* cls);
    // Always empty: callers that want names turn the classes of algorithms() into names.
    const ZyrRmCStringArray& algorithmClassNames() const;

    // The reader of text streams of an old release: groups 1 (formula), 2 (parameter name),
    // 3 (algorithm class name) and 40 (parameter value), until another group code, which is
    // pushed back. Names and values pair up by position; the surplus of the longer list is
    // dropped. The filer's status when a foreign group ended the read, else the read's status.
    Hsys::ErrorStatus tdfInFieldsQuillon(HsDbTdfFiler* filer);

    // What the cache holds now, most recently used first; stale entries stay until the next
    // evaluation.
    const ResultCache& resultCache() const { return m_cache; }

private:
    // Asserts write, reports the change and marks the cache stale: the steps every change of
    // formula or parameters takes before it changes anything.
    void beginFormulaChange(ParameterId changed);
    void beginAlgorithmChange();
    Hsys::ErrorStatus bdfInModifierFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutModifierFields(HsDbBdfFiler* filer) const;

    ZyrParametricExpressionHandler m_expressionHandler;
    AlgorithmCollection m_algorithms;
    mutable bool m_cacheValid = true;
    mutable ResultCache m_cache{kCacheSize};
};

// The modifier as the database stores it, in the dictionary ZyrDictAreaModifiers. Everything is
// forwarded to ZyrImpAreaModifier: getters need read access, changes write access. A record
// without its implementation object (made by the bool constructor and never given one) throws
// HsAssertionViolation on any forward.
class ZyrDbAreaModifier : public ZyrDbPair<ZyrDbAreaModifier, ZyrDbDictRecord, ZyrImpAreaModifier> {
    ZYR_AREACALC_DECLARE_FILED_MEMBERS(ZyrDbAreaModifier)

public:
    static constexpr const wchar_t* kClassIdWord = L"ZyrAreaModifierStyle";

    using ParameterPairVector = ZyrImpAreaModifier::ParameterPairVector;
    using AlgorithmCollection = ZyrImpAreaModifier::AlgorithmCollection;

    using ZyrDbPair::ZyrDbPair;

    static void getHardCodedValueName(std::wstring& name);

    [[nodiscard]] Hsys::ErrorStatus evaluateExpr(double value, double& result) const;
    const ParameterPairVector& parameterPairVector() const;
    const ZyrRmCString& expression() const;
    Hsys::ErrorStatus setExpression(const ZyrRmCString& text);
    Hsys::ErrorStatus addParameter(const ZyrRmCString& name, double value);
    Hsys::ErrorStatus removeParameter(const ZyrRmCString& name);
    Hsys::ErrorStatus renameParameterName(const ZyrRmCString& oldName, const ZyrRmCString& newName);
    void partialReplacedExpression(ZyrRmCString& result) const;
    void fullyReplacedExpression(double value, ZyrRmCString& result) const;
    const AlgorithmCollection& algorithms() const;
    AlgorithmCollection& algorithms();
    Hsys::ErrorStatus addAlgorithm(HsRxClass* cls);
    Hsys::ErrorStatus removeAlgorithm(HsRxClass* cls);
    const ZyrRmCStringArray& algorithmClassNames() const;
    // The record's description, as a calculation shows it beside the name.
    ZyrRmCString description() const;

    ZyrImpAreaModifier* areaModifierImp() { return pairImp(); }
    const ZyrImpAreaModifier* areaModifierImp() const { return pairImp(); }

private:
    const ZyrImpAreaModifier& readImp() const;
    ZyrImpAreaModifier& writeImp();
};
