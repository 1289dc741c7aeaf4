#include "data/Datum.h"

#include <cstdint>
#include <cstdlib>

// What reads as a date is a valid date whose text reads back as the same date.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const QString text = QString::fromUtf8(reinterpret_cast<const char *>(data), qsizetype(size));
    const auto datum = LeseDatum(text);
    if (!datum)
        return 0;
    const int wochentag = WochentagVon(*datum);
    if (!datum->isValid() || datum->year() < 1 || wochentag < 1 || wochentag > 7)
        std::abort();
    const QString normal = DatumText(*datum);
    if (normal.size() != 10 || LeseDatum(normal) != datum)
        std::abort();
    return 0;
}
