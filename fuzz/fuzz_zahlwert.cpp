#include "data/Werte.h"

#include <cmath>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const QString text = QString::fromUtf8(reinterpret_cast<const char *>(data), qsizetype(size));
    const double wert = ZahlWert(text);
    if (std::isnan(wert))
        std::abort();
    const auto gerundet = RundeInt16(wert);
    // Halves to even agrees with the default rounding mode of the machine.
    const double nah = std::nearbyint(wert);
    const bool imBereich = nah >= -32768.0 && nah <= 32767.0;
    if (gerundet.has_value() != imBereich || (gerundet && *gerundet != nah))
        std::abort();
    return 0;
}
