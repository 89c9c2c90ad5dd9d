// Reads arbitrary bytes as the filed stream of a database object. The first byte chooses the
// class; the reader must fail cleanly or succeed, and what it read must file out and back in to
// the very same bytes.
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

namespace {

using Maker = HsDbObject* (*)();

const Maker kMakers[] = {
    []() -> HsDbObject* { return new TestGadget; },
    []() -> HsDbObject* { return new HsDbDictionary; },
    []() -> HsDbObject* { return new HsDbBlockTableRecord; },
    []() -> HsDbObject* { return new HsDbLayerTable; },
    []() -> HsDbObject* { return new HsDbTextStyleTableRecord; },
    []() -> HsDbObject* { return new HsDbPolyline; },
    []() -> HsDbObject* { return new HsDbProxyObject(L"Unknown"); },
};

std::vector<std::uint8_t> fileOut(const HsDbObject& object, HsDbDatabase* database) {
    HsDbBdfFiler writer(database);
    if (object.bdfOut(&writer) != Hsys::eSuccess)
        __builtin_trap();
    return writer.bytes();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0)
        return 0;
    const Maker make = kMakers[data[0] % std::size(kMakers)];
    HsDbDatabase database(HsDb::kEmptyDatabase, HsDb::kNoTransactions);

    std::unique_ptr<HsDbObject> object(make());
    HsDbBdfFiler reader(std::vector<std::uint8_t>(data + 1, data + size), &database);
    if (object->bdfIn(&reader) != Hsys::eSuccess)
        return 0;

    const std::vector<std::uint8_t> first = fileOut(*object, &database);
    std::unique_ptr<HsDbObject> again(make());
    HsDbBdfFiler rereader(first, &database);
    if (again->bdfIn(&rereader) != Hsys::eSuccess || rereader.remaining() != 0 ||
        fileOut(*again, &database) != first)
        __builtin_trap();
    return 0;
}
