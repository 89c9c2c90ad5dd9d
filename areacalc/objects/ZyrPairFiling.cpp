#include "areacalc/objects/ZyrPairFiling.h"

namespace Zyr {

const wchar_t* tdfNotSupportedMessage() {
    return L"Area objects cannot be read from a text drawing file: they are kept in the binary "
           L"drawing file only";
}

} // namespace Zyr
