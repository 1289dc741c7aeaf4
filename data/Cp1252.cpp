#include "data/Cp1252.h"

#include <array>
#include <cstdint>

namespace {

// 0x80-0x9F; the undefined bytes 0x81, 0x8D, 0x8F, 0x90 and 0x9D stand for themselves.
constexpr char16_t Bereich80[32] = {
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
    0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x008D, 0x017D, 0x008F,
    0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
    0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178,
};

struct Tabellen {
    std::array<char16_t, 256> zeichen{};
    // The byte of every UTF-16 unit; Keins where the code page has no such character
    // (surrogates included, so a character beyond U+FFFF never encodes).
    static constexpr uint16_t Keins = 0x100;
    std::array<uint16_t, 0x10000> byte;

    Tabellen()
    {
        byte.fill(Keins);
        for (int b = 0; b < 256; ++b) {
            zeichen[b] = (b >= 0x80 && b < 0xA0) ? Bereich80[b - 0x80] : char16_t(b);
            byte[zeichen[b]] = uint16_t(b);
        }
    }
};

const Tabellen &tabellen()
{
    static const Tabellen t;
    return t;
}

} // namespace

QString DekodiereCp1252(const char *daten, qsizetype laenge)
{
    const auto &zeichen = tabellen().zeichen;
    QString text(laenge, Qt::Uninitialized);
    char16_t *ziel = reinterpret_cast<char16_t *>(text.data());
    const auto *quelle = reinterpret_cast<const unsigned char *>(daten);
    for (qsizetype i = 0; i < laenge; ++i)
        ziel[i] = zeichen[quelle[i]];
    return text;
}

bool KodiereCp1252(const QString &text, QByteArray &ziel)
{
    const Tabellen &t = tabellen();
    const qsizetype alt = ziel.size();
    ziel.resize(alt + text.size());
    char *schreib = ziel.data() + alt;
    const char16_t *lese = reinterpret_cast<const char16_t *>(text.constData());
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t c = lese[i];
        const uint16_t b = t.byte[c];
        if (b == Tabellen::Keins) {
            ziel.resize(alt + i);
            return false;
        }
        schreib[i] = char(b);
    }
    return true;
}

bool IstCp1252(QChar zeichen)
{
    return tabellen().byte[zeichen.unicode()] != Tabellen::Keins;
}

bool IstCp1252(const QString &text)
{
    const Tabellen &t = tabellen();
    for (const QChar c : text) {
        if (t.byte[c.unicode()] == Tabellen::Keins)
            return false;
    }
    return true;
}
