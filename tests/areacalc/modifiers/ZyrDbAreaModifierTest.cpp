// Area modifier records: their cache of results, changes of formula and parameters, formulas
// written out, copies, summaries, binary filing and the old text stream.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/ge/HsGeContext.h"

namespace {

using ZyrAreaModifiers = ZyrAreaDrawing;
using Parameters = ZyrImpAreaModifier::ParameterPairVector;
using Status = Hsys::ErrorStatus;

double evaluated(const ZyrDbAreaModifier& modifier, double value) {
    double result = 0.0;
    EXPECT_EQ(modifier.evaluateExpr(value, result), Hsys::eSuccess) << value;
    return result;
}

const ZyrImpAreaModifier::ResultCache& cacheOf(const ZyrDbAreaModifier& modifier) {
    return modifier.areaModifierImp()->resultCache();
}

// Widens the point tolerance for a test, so that a shared entry shows in six decimals.
struct ScopedPointTolerance {
    explicit ScopedPointTolerance(double tolerance) : saved(HsGeContext::gTol.equalPoint()) {
        HsGeContext::gTol.setEqualPoint(tolerance);
    }
    ~ScopedPointTolerance() { HsGeContext::gTol.setEqualPoint(saved); }
    double saved;
};

// Read from a record open for read, as a calculation reads it.
TEST_F(ZyrAreaModifiers, theCacheEvictsTheLeastRecentlyUsedValueNotTheOldest) {
    const HsDbObjectPointer<ZyrDbAreaModifier> opened(addModifier(L"Half", L"_AREA_VALUE_*0.5"),
                                                      HsDb::kForRead);
    ASSERT_TRUE(opened);
    const ZyrDbAreaModifier& modifier = *opened.object();
    for (int value = 0; value < 200; ++value)
        evaluated(modifier, value);
    const auto& cache = cacheOf(modifier);
    ASSERT_EQ(cache.size(), 200u);
    EXPECT_EQ(evaluated(modifier, 0), 0.0) << "a hit saves the oldest entry";
    EXPECT_EQ(evaluated(modifier, 200), 100.0);
    EXPECT_EQ(cache.size(), 200u);
    EXPECT_TRUE(cache.has(0));
    EXPECT_FALSE(cache.has(1)) << "the least recently used went";
    EXPECT_TRUE(cache.has(2));
    EXPECT_EQ(cache.entries().front().first, 200);
}

TEST_F(ZyrAreaModifiers, toleranceEqualValuesShareAnEntryAndItsResult) {
    const ScopedPointTolerance tolerance(0.01);
    ZyrDbAreaModifier modifier;
    ASSERT_EQ(modifier.setExpression(L"_AREA_VALUE_*1000"), Hsys::eSuccess);
    const std::tuple<double, double, std::size_t> steps[] = {
        {10.0, 10000.0, 1},   {10.005, 10000.0, 1}, // the first value's result
        {9.99, 10000.0, 1},                         // exactly the tolerance away still counts
        {10.015, 10015.0, 2}, {10.008, 10015.0, 2}, // near both: the most recently used answers
        {10.0, 10000.0, 2},   {10.008, 10000.0, 2},
    };
    for (const auto& [value, result, entries] : steps) {
        EXPECT_EQ(evaluated(modifier, value), result) << value;
        EXPECT_EQ(cacheOf(modifier).size(), entries) << value;
    }
}

TEST_F(ZyrAreaModifiers, aFailedEvaluationCachesNothingAndIsTriedAgain) {
    ZyrDbAreaModifier modifier;
    EXPECT_EQ(evaluated(modifier, -12.25), -12.25) << "a new record changes nothing";
    ASSERT_EQ(modifier.setExpression(L"1/(_AREA_VALUE_-2)"), Hsys::eSuccess);
    for (int attempt = 0; attempt < 2; ++attempt) {
        double result = 7.0;
        EXPECT_EQ(modifier.evaluateExpr(2.0, result), Hsys::eInvalidInput) << attempt;
        EXPECT_EQ(result, 7.0);
        EXPECT_TRUE(cacheOf(modifier).empty());
    }
    EXPECT_EQ(evaluated(modifier, 4.0), 0.5);
}

// A refused change keeps both the record and its results.
TEST_F(ZyrAreaModifiers, aChangedFormulaEmptiesTheCacheAtTheNextEvaluation) {
    using M = ZyrDbAreaModifier;
    const std::tuple<Status (*)(M&), Status, double, bool> cases[] = {
        {[](M& m) { return m.setExpression(L"_AREA_VALUE_*k+j"); }, Hsys::eSuccess, 10, true},
        {[](M& m) { return m.setExpression(L"_AREA_VALUE_*k+1"); }, Hsys::eSuccess, 11, false},
        {[](M& m) { return m.addParameter(L"h", 1); }, Hsys::eSuccess, 10, false},
        {[](M& m) { return m.removeParameter(L"i"); }, Hsys::eSuccess, 10, false},
        {[](M& m) { return m.removeAlgorithm(areaAlgorithm()); }, Hsys::eSuccess, 10, true},
        {[](M& m) { return m.renameParameterName(L"x", L"j"); }, Hsys::eNameNotFound, 10, false},
        {[](M& m) { return m.renameParameterName(L"k", L"k"); }, Hsys::eSuccess, 10, true},
        {[](M& m) { return m.addParameter(L"k", 3); }, Hsys::eDuplicateName, 10, true},
        {[](M& m) { return m.removeParameter(L"x"); }, Hsys::eNameNotFound, 10, true},
        {[](M& m) { return m.addAlgorithm(nullptr); }, Hsys::eBadArgument, 10, true},
        {[](M& m) { return m.addAlgorithm(areaAlgorithm()); }, Hsys::eDuplicateName, 10, true},
        {[](M& m) { return m.removeAlgorithm(nullptr); }, Hsys::eBadArgument, 10, true},
        {[](M& m) { return m.removeAlgorithm(ZyrDbAreaStyle::desc()); }, Hsys::eNameNotFound, 10,
         true},
    };
    for (std::size_t i = 0; i < std::size(cases); ++i) {
        SCOPED_TRACE(i);
        const auto& [change, status, resultOfFive, keepsResults] = cases[i];
        ZyrDbAreaModifier modifier;
        ASSERT_EQ(modifier.algorithms().items(), (Classes{areaAlgorithm(), perimeterAlgorithm()}));
        ASSERT_EQ(modifier.setExpression(L"_AREA_VALUE_*k+j"), Hsys::eSuccess);
        for (const auto& [name, value] : {std::pair{L"k", 2}, {L"j", 0}, {L"i", 7}})
            ASSERT_EQ(modifier.addParameter(name, value), Hsys::eSuccess);
        evaluated(modifier, 5);
        evaluated(modifier, 6);
        const Parameters parameters = modifier.parameterPairVector();
        EXPECT_EQ(change(modifier), status);
        if (status != Hsys::eSuccess) {
            EXPECT_EQ(std::pair(modifier.parameterPairVector(), modifier.algorithms().count()),
                      std::pair(parameters, 2));
        }
        EXPECT_EQ(cacheOf(modifier).size(), 2u) << "stale results stay until the next evaluation";
        EXPECT_EQ(evaluated(modifier, 5), resultOfFive);
        EXPECT_EQ(cacheOf(modifier).size(), keepsResults ? 2u : 1u);
    }
}

// A parameter named like the area value would be written in over it, but for the protection.
TEST_F(ZyrAreaModifiers, writtenOutFormulasKeepTheAreaValueApartFromParameters) {
    ZyrDbAreaModifier modifier;
    ASSERT_EQ(modifier.setExpression(L"_AREA_VALUE_*factor+_AREA_VALUE_"), Hsys::eSuccess);
    ASSERT_EQ(modifier.addParameter(L"factor", 0.25), Hsys::eSuccess);
    ASSERT_EQ(modifier.addParameter(L"_AREA_VALUE_", 99), Hsys::eSuccess);
    EXPECT_EQ(evaluated(modifier, 4), 5.0);

    ZyrRmCString text;
    modifier.partialReplacedExpression(text);
    EXPECT_EQ(text, L"_AREA_VALUE_*0.25+_AREA_VALUE_");
    modifier.fullyReplacedExpression(8, text);
    EXPECT_EQ(text, L"8*0.25+8");
    EXPECT_EQ(cacheOf(modifier).size(), 1u);
    EXPECT_EQ(evaluated(modifier, 4), 5.0);
}

TEST_F(ZyrAreaModifiers, aCopyTakesFormulaAndAlgorithmsButKeepsItsFormerResults) {
    ZyrDbAreaModifier source;
    ASSERT_EQ(source.setExpression(L"_AREA_VALUE_*k"), Hsys::eSuccess);
    ASSERT_EQ(source.addParameter(L"k", 3), Hsys::eSuccess);
    ASSERT_EQ(source.removeAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    ZyrDbAreaModifier copy;
    EXPECT_EQ(evaluated(copy, 5), 5.0);
    ASSERT_EQ(copy.areaModifierImp()->copyFrom(source.areaModifierImp()), Hsys::eSuccess);
    EXPECT_EQ(std::pair(copy.parameterPairVector(), copy.algorithms().items()),
              std::pair(source.parameterPairVector(), source.algorithms().items()));
    EXPECT_EQ(evaluated(copy, 5), 5.0) << "the result of the former formula";
    EXPECT_EQ(evaluated(copy, 6), 18.0);

    ZyrImpAreaStyle style;
    EXPECT_EQ(copy.areaModifierImp()->copyFrom(&style), Hsys::eBadArgument);
}

TEST_F(ZyrAreaModifiers, theSummaryShowsAlgorithmsSortedParametersAndTheFormulaInWords) {
    ZyrDbAreaModifier modifier;
    ASSERT_EQ(modifier.setExpression(L"_AREA_VALUE_*b+a"), Hsys::eSuccess);
    ASSERT_EQ(modifier.addParameter(L"b", 0.5), Hsys::eSuccess);
    ASSERT_EQ(modifier.addParameter(L"a", 2), Hsys::eSuccess);
    ASSERT_EQ(modifier.removeAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    ZyrDesc desc(&database);
    modifier.areaModifierImp()->summaryInfo(&desc);

    const std::vector<ZyrRmCString> lines = desc.lines();
    ASSERT_EQ(lines.size(), 5u) << "one algorithm, the count, two parameters, the formula";
    EXPECT_EQ(lines[1], L"Parameters: 2");
    EXPECT_EQ(desc.rows()[2].label, L"a");
    EXPECT_EQ(desc.rows()[3].label, L"b");
    EXPECT_EQ(lines[4], L"Formula: AREA*b+a");
}

// The implementation level by hand: its base levels, then its own fields in their order. A reader
// gives the record whole or leaves it as it was: for every truncation, a count that the stream
// cannot hold, and a newer version.
TEST_F(ZyrAreaModifiers, theRecordIsFiledInItsOrderAndReadWholeOrNotAtAll) {
    const auto stream = [](std::uint32_t parameterCount, std::int16_t version) {
        HsDbBdfFiler filer;
        filer.writeInt16(80); // ZyrImpObj
        filer.writeInt16(80); // ZyrImpDictRecord
        filer.writeString(L"Roof");
        filer.writeString(L"");
        filer.writeInt16(version); // ZyrImpAreaModifier
        filer.writeString(L"_AREA_VALUE_*k");
        filer.writeUInt32(parameterCount);
        filer.writeString(L"k");
        filer.writeDouble(0.5);
        filer.writeUInt32(1);
        filer.writeString(L"ZyrAreaCalculationAreaAlgorithm");
        return filer.bytes();
    };
    ZyrImpAreaModifier roof;
    ASSERT_EQ(roof.setName(L"Roof"), Hsys::eSuccess);
    ASSERT_EQ(roof.setExpression(L"_AREA_VALUE_*k"), Hsys::eSuccess);
    ASSERT_EQ(roof.addParameter(L"k", 0.5), Hsys::eSuccess);
    ASSERT_EQ(roof.removeAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    HsDbBdfFiler written;
    ASSERT_EQ(roof.bdfOutFields(&written), Hsys::eSuccess);
    const std::vector<std::uint8_t>& bytes = written.bytes();
    ASSERT_EQ(bytes, stream(1, 80));

    std::vector<std::pair<std::vector<std::uint8_t>, Status>> cases{
        {stream(0xFFFFFFFF, 80), Hsys::eFilerError}, {stream(1, 81), Hsys::eNewerVersion}};
    for (std::size_t length = 0; length < bytes.size(); ++length)
        cases.push_back(
            {{bytes.begin(), bytes.begin() + static_cast<long>(length)}, Hsys::eFilerError});
    cases.push_back({bytes, Hsys::eSuccess});
    for (const auto& [filed, status] : cases) {
        HsDbBdfFiler reader(filed, &database);
        ZyrImpAreaModifier read;
        ASSERT_EQ(read.bdfInFields(&reader), status) << filed.size();
        const bool whole = status == Hsys::eSuccess;
        ASSERT_EQ(
            std::tuple(read.expression(), read.parameterPairVector(), read.algorithms().count()),
            whole ? std::tuple(roof.expression(), roof.parameterPairVector(), 1)
                  : std::tuple(ZyrRmCString(L"_AREA_VALUE_"), Parameters{}, 2))
            << filed.size();
    }
}

// Names and values pair by position; a later formula wins and a foreign group ends the read.
TEST_F(ZyrAreaModifiers, anOldGroupStreamPairsNamesWithValuesByPosition) {
    const std::tuple<std::vector<HsDbTdfItem>, Status, const wchar_t*, Parameters, Classes,
                     std::size_t>
        cases[] = {
            {{{1, L"_AREA_VALUE_*a"},
              {2, L"a"},
              {2, L"b"},
              {40, 0.5},
              {3, L"ZyrAreaCalculationAreaAlgorithm"}},
             Hsys::eSuccess,
             L"_AREA_VALUE_*a",
             {{L"a", 0.5}},
             {areaAlgorithm()},
             5},
            {{{1, L"a"}, {40, 1.0}, {40, 2.0}, {1, L"_AREA_VALUE_"}, {2, L"a"}, {70, 5}, {1, L"x"}},
             Hsys::eSuccess,
             L"_AREA_VALUE_",
             {{L"a", 1.0}},
             {},
             5},
            {{{1, L"f"}, {40, L"text"}}, Hsys::eWrongType, L"f", {}, {}, 2},
        };
    for (const auto& [items, status, formula, parameters, algorithms, position] : cases) {
        HsDbTdfFiler filer(items, HsDb::kFileFiler, false);
        ZyrImpAreaModifier modifier;
        EXPECT_EQ(modifier.tdfInFieldsQuillon(&filer), status) << formula;
        EXPECT_EQ(std::tuple(modifier.expression().str(), modifier.parameterPairVector(),
                             modifier.algorithms().items(), filer.position()),
                  std::tuple(std::wstring(formula), parameters, algorithms, position));
    }
}

} // namespace
