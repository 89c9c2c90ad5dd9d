// The settings of calculations while the application runs: which algorithms take part, and how
// previews of objects are made in each open database. Not stored in any drawing.
#pragma once

#include "platform/base/obj/ZyrTransactable.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstdint>
#include <utility>
#include <vector>

class HsDbDatabase;
class HsRxClass;
class ZyrAreaCalculationAlgorithm;

// The working board. It is valid from a refresh (invalidate) until reset or the end of the scope
// of a ZyrAreaCalculationWhiteBoardPtr. Lookups never fail: what they do not find, they answer
// with a default or with a permanently empty record.
class ZyrAreaCalculationWhiteBoardImp {
public:
    // A display configuration: its id and name.
    using ConfigPair = std::pair<HsDbObjectId, ZyrRmCString>;
    using ConfigPairVector = std::vector<ConfigPair>;
    using AlgorithmVector = std::vector<ZyrAreaCalculationAlgorithm*>;

    static constexpr std::uint32_t kDefaultBitmapSize = 150;
    static constexpr std::uint32_t kDefaultColorDepth = 8;
    static constexpr std::uint32_t kNoPairId = 0xFFFFFFFFu;

    // What is known of one display representation in one database.
    struct EvaluationDesc {
        // Position in dispReps; the key.
        std::uint32_t dispRepIndex = 0;
        // Position in configurations of the current one.
        std::uint32_t currentPairId = 0;
        ConfigPairVector configurations;
        std::uint32_t bitmapWidth = kDefaultBitmapSize;
        std::uint32_t bitmapHeight = kDefaultBitmapSize;
    };

    struct DatabaseEvaluationDesc {
        HsDbDatabase* database = nullptr;
        // Bits per pixel of previews.
        std::uint32_t colorDepth = kDefaultColorDepth;
        // One per representation with at least one configuration, in the order of dispReps.
        std::vector<EvaluationDesc> evaluationDescs;
    };

    // A row: the object class, the representation class and whether previews are made for it.
    using DispRep = std::pair<HsRxClass*, std::pair<HsRxClass*, bool>>;

    ZyrAreaCalculationWhiteBoardImp() = default;
    ZyrAreaCalculationWhiteBoardImp(const ZyrAreaCalculationWhiteBoardImp&) = delete;
    ZyrAreaCalculationWhiteBoardImp& operator=(const ZyrAreaCalculationWhiteBoardImp&) = delete;
    virtual ~ZyrAreaCalculationWhiteBoardImp();

    bool valid() const { return m_valid; }
    // A board goes stale at the end of the scope in which it may be changed.
    void setValid(bool valid) { m_valid = valid; }
    // Both refresh the board and make it valid, whatever the names say. Without a list, the
    // working database is the one refreshed.
    void invalidate();
    void invalidate(const std::vector<HsDbDatabase*>& databases);
    // Forgets the databases and makes the board stale; attached algorithms and representations
    // stay.
    void reset();

    // eDuplicateName when an algorithm of the class is attached already, eDoesNotApply without
    // services or algorithm factory, eWrongClass when the class makes no algorithm. The board need
    // not be valid.
    [[nodiscard]] Hsys::ErrorStatus attachAlgorithm(HsRxClass* algorithmClass);
    // A null class detaches all. eNameNotFound when the class is not attached, unless nothing is.
    [[nodiscard]] Hsys::ErrorStatus detachAlgorithm(HsRxClass* algorithmClass);
    // The attached algorithm of the class, or null.
    ZyrAreaCalculationAlgorithm* algorithm(HsRxClass* algorithmClass) const;
    // In the order of attaching; not owned.
    const AlgorithmVector& algorithmVector() const { return m_algorithms; }

    // Appends the representation classes in the order of the rows.
    void applicableDispReps(std::vector<HsRxClass*>& classes) const;
    // The current configuration, or the empty pair for null arguments, a missing record or a
    // position out of range.
    const ConfigPair& currentConfigPair(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    // Its position, or kNoPairId in the same cases.
    unsigned int currentConfigPairId(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    // The configurations in which the representation can be shown; empty without a record.
    const ConfigPairVector& configurationVector(HsDbDatabase* database,
                                                HsRxClass* dispRepClass) const;
    // 150 by 150 unless the representation has a record in the database.
    void bitmapSize(HsDbDatabase* database, HsRxClass* dispRepClass, unsigned int& x,
                    unsigned int& y) const;
    // False for an unknown representation: previews are made only for what a client enabled.
    bool isBitmapEnabled(HsRxClass* dispRepClass) const;
    // 8 for a null or unknown database.
    unsigned int colorDepth(HsDbDatabase* database) const;

    ZyrAreaCalculationWhiteBoardImp* clone() const;
    // Copies the state of being valid, and unless source and target are one, the content.
    void copyFrom(const ZyrAreaCalculationWhiteBoardImp* other);

    // Searches by representation class and by database; index is written on a hit only.
    bool hasDispRep(HsRxClass* dispRepClass, unsigned int& index) const;
    bool hasDatabase(HsDbDatabase* database, unsigned int& index) const;
    // The record of the representation in the database, found by the representation's position
    // in dispReps; the empty one, with found false, when there is none.
    const EvaluationDesc& evaluationDesc(HsDbDatabase* database, HsRxClass* dispRepClass,
                                         bool& found) const;
    // False for null arguments.
    bool hasEvaluationDesc(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    // The database's records, or an empty list.
    const std::vector<EvaluationDesc>& evaluationDescVector(HsDbDatabase* database) const;

    // Prints the board on the host's text console; title may be null.
    void dump(const wchar_t* title, int level) const;

private:
    void dumpAlgorithms(const wchar_t* title, int level) const;
    void dumpDispReps(const wchar_t* title, int level) const;
    void dumpDatabase(const DatabaseEvaluationDesc& record, const wchar_t* title, int level) const;
    void dumpEvaluationDesc(const EvaluationDesc& record, const wchar_t* title, int level) const;
    void dumpConfigurations(const ConfigPairVector& configurations, const wchar_t* title,
                            int level) const;

    bool m_valid = false;
    std::vector<DispRep> m_dispReps;
    std::vector<DatabaseEvaluationDesc> m_databases;
    AlgorithmVector m_algorithms;
};

// The board as the services hand it out. A transaction puts a copy in force, and every operation
// works on the copy in force, which need not be the object it was called on.
class ZyrAreaCalculationWhiteBoard : public ZyrTransactable {
public:
    ZyrAreaCalculationWhiteBoard();

    // The virtual operations after the transaction operations, in the order of their slots.
    ~ZyrAreaCalculationWhiteBoard() override;
    // A new board with a copy of this object's own imp.
    ZyrTransactable* clone() const override;
    // Nothing for null or for another class of transactable.
    void copyFrom(const ZyrTransactable* other) override;
    // Refresh the board and make it valid (the imp's invalidate).
    virtual void validate();
    virtual void validate(const std::vector<HsDbDatabase*>& databases);
    virtual void reset();
    virtual void dump() const;

    // The imp of the board in force; null if the object in force is no white board.
    ZyrAreaCalculationWhiteBoardImp* imp();
    const ZyrAreaCalculationWhiteBoardImp* imp() const;

    [[nodiscard]] Hsys::ErrorStatus attachAlgorithm(HsRxClass* algorithmClass);
    [[nodiscard]] Hsys::ErrorStatus detachAlgorithm(HsRxClass* algorithmClass);
    ZyrAreaCalculationAlgorithm* algorithm(HsRxClass* algorithmClass) const;
    const ZyrAreaCalculationWhiteBoardImp::AlgorithmVector& algorithmVector() const;
    void applicableDispReps(std::vector<HsRxClass*>& classes) const;
    const ZyrAreaCalculationWhiteBoardImp::ConfigPair&
    currentConfigPair(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    unsigned int currentConfigPairId(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    const ZyrAreaCalculationWhiteBoardImp::ConfigPairVector&
    configurationVector(HsDbDatabase* database, HsRxClass* dispRepClass) const;
    void bitmapSize(HsDbDatabase* database, HsRxClass* dispRepClass, unsigned int& x,
                    unsigned int& y) const;
    bool isBitmapEnabled(HsRxClass* dispRepClass) const;
    unsigned int colorDepth(HsDbDatabase* database) const;

private:
    explicit ZyrAreaCalculationWhiteBoard(ZyrAreaCalculationWhiteBoardImp* imp) : m_imp(imp) {}
    // The imp in force; a board never has another transactable in force.
    ZyrAreaCalculationWhiteBoardImp& current();
    const ZyrAreaCalculationWhiteBoardImp& current() const;

    ZyrAreaCalculationWhiteBoardImp* m_imp;
};
