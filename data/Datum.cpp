#include "data/Datum.h"

#include "data/Werte.h"

namespace {

bool IstBlank(QChar c)
{
    return c == u' ' || c == u'\t';
}

// Reads 1 .. maxStellen ASCII digits at pos; returns the number of digits read (0: none).
int LeseZiffern(const QString &text, qsizetype &pos, qsizetype ende, int maxStellen, int &wert)
{
    int stellen = 0;
    wert = 0;
    while (pos < ende && stellen < maxStellen + 1) {
        const char16_t c = text[pos].unicode();
        if (c < u'0' || c > u'9')
            break;
        wert = wert * 10 + (c - u'0');
        ++stellen;
        ++pos;
    }
    return stellen;
}

} // namespace

std::optional<QDate> LeseDatum(const QString &text)
{
    qsizetype anfang = 0;
    qsizetype ende = text.size();
    while (anfang < ende && IstBlank(text[anfang]))
        ++anfang;
    while (ende > anfang && IstBlank(text[ende - 1]))
        --ende;

    qsizetype pos = anfang;
    int tag = 0, monat = 0, jahr = 0;
    const int tagStellen = LeseZiffern(text, pos, ende, 2, tag);
    if (tagStellen < 1 || tagStellen > 2 || pos >= ende || text[pos] != u'.')
        return std::nullopt;
    ++pos;
    const int monatStellen = LeseZiffern(text, pos, ende, 2, monat);
    if (monatStellen < 1 || monatStellen > 2 || pos >= ende || text[pos] != u'.')
        return std::nullopt;
    ++pos;
    const int jahrStellen = LeseZiffern(text, pos, ende, 4, jahr);
    if (pos != ende || (jahrStellen != 2 && jahrStellen != 4))
        return std::nullopt;
    if (jahrStellen == 2)
        jahr += jahr < 30 ? 2000 : 1900;
    if (jahr < 1 || !QDate::isValid(jahr, monat, tag))
        return std::nullopt;
    return QDate(jahr, monat, tag);
}

QDate LeseDatumOderFehler(const QString &text)
{
    const auto datum = LeseDatum(text);
    if (!datum)
        throw Laufzeitfehler("Kein Datum");
    return *datum;
}

QString DatumText(const QDate &datum)
{
    if (!datum.isValid() || datum.year() < 1 || datum.year() > 9999)
        return QString();
    const int werte[3] = {datum.day(), datum.month(), datum.year()};
    char16_t zeichen[10];
    zeichen[0] = u'0' + werte[0] / 10;
    zeichen[1] = u'0' + werte[0] % 10;
    zeichen[2] = u'.';
    zeichen[3] = u'0' + werte[1] / 10;
    zeichen[4] = u'0' + werte[1] % 10;
    zeichen[5] = u'.';
    zeichen[6] = u'0' + werte[2] / 1000;
    zeichen[7] = u'0' + werte[2] / 100 % 10;
    zeichen[8] = u'0' + werte[2] / 10 % 10;
    zeichen[9] = u'0' + werte[2] % 10;
    return QString(reinterpret_cast<const QChar *>(zeichen), 10);
}

// QDate counts Monday = 1 .. Sunday = 7; an invalid date gives 0.
int WochentagVon(const QDate &datum)
{
    if (!datum.isValid())
        return 0;
    return datum.dayOfWeek() % 7 + 1;
}
