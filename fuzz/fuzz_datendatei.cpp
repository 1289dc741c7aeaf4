#include "data/DatenDatei.h"

#include "data/InitMini.h"

#include <cstdint>
#include <cstdlib>

// Any input either fails to load or loads; what loads saves, and saving is a fixed point of
// loading: load(save(x)) saves to the same bytes again.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size)
{
    const QByteArray inhalt(reinterpret_cast<const char *>(data), qsizetype(size));
    InitMini d;
    d.Sperre = {7};
    if (!LeseDaten(inhalt, d)) {
        if (d.Sperre != std::vector<int16_t>{7} || d.AnzahlMinis != 0)
            std::abort();
        return 0;
    }
    if (d.Minis.size() != std::size_t(d.AnzahlMinis) + 1 || d.Sperre.size() != d.Minis.size()
        || d.Ausnahmen.size() != std::size_t(d.AnzahlAusnahmen) + 1
        || d.Plan.size() != std::size_t(d.AnzahlPlanEintraege) + 1)
        std::abort();
    QByteArray erstes;
    if (!SchreibeDaten(d, erstes))
        std::abort();
    InitMini wieder;
    if (!LeseDaten(erstes, wieder))
        std::abort();
    QByteArray zweites;
    if (!SchreibeDaten(wieder, zweites) || zweites != erstes)
        std::abort();
    return 0;
}
