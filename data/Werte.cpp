#include "data/Werte.h"

#include <charconv>
#include <cmath>
#include <string>

namespace {

bool IstLeerzeichen(char16_t c)
{
    return c == u' ' || c == u'\t' || c == u'\n';
}

bool IstZiffer(char16_t c)
{
    return c >= u'0' && c <= u'9';
}

// Value of an ASCII digit in base 16, or -1.
int ZiffernWert(char16_t c)
{
    if (c >= u'0' && c <= u'9')
        return c - u'0';
    if (c >= u'a' && c <= u'f')
        return c - u'a' + 10;
    if (c >= u'A' && c <= u'F')
        return c - u'A' + 10;
    return -1;
}

double GanzeZahl(const std::u16string &z, std::size_t pos, int basis)
{
    double wert = 0;
    for (; pos < z.size(); ++pos) {
        const int ziffer = ZiffernWert(z[pos]);
        if (ziffer < 0 || ziffer >= basis)
            break;
        wert = wert * basis + ziffer;
    }
    return wert;
}

// Rough decimal magnitude of a number text the conversion found out of range: only its sign
// matters (positive: overflow, otherwise underflow).
long Zehnerpotenz(const std::string &zahl)
{
    long stellen = 0;
    bool vorKomma = true;
    bool gefunden = false;
    std::size_t pos = 0;
    for (; pos < zahl.size() && zahl[pos] != 'e'; ++pos) {
        const char c = zahl[pos];
        if (c == '.') {
            vorKomma = false;
        } else if (c >= '0' && c <= '9') {
            if (c != '0')
                gefunden = true;
            if (vorKomma && gefunden)
                ++stellen;
            else if (!vorKomma && !gefunden)
                --stellen;
        }
    }
    long exponent = 0;
    bool negativ = false;
    for (++pos; pos < zahl.size(); ++pos) {
        if (zahl[pos] == '-')
            negativ = true;
        else if (zahl[pos] >= '0' && zahl[pos] <= '9' && exponent < 100000000)
            exponent = exponent * 10 + (zahl[pos] - '0');
    }
    return stellen + (negativ ? -exponent : exponent);
}

double Dezimalzahl(const std::u16string &z)
{
    // Collect the longest prefix of the shape [+-]digits[.digits][(E|D)[+-]digits] as ASCII.
    std::string zahl;
    std::size_t pos = 0;
    if (pos < z.size() && (z[pos] == u'+' || z[pos] == u'-'))
        zahl += char(z[pos++]);
    bool ziffern = false;
    for (; pos < z.size() && IstZiffer(z[pos]); ++pos, ziffern = true)
        zahl += char(z[pos]);
    if (pos < z.size() && z[pos] == u'.') {
        zahl += '.';
        for (++pos; pos < z.size() && IstZiffer(z[pos]); ++pos, ziffern = true)
            zahl += char(z[pos]);
    }
    if (!ziffern)
        return 0;
    if (pos < z.size() && (z[pos] == u'E' || z[pos] == u'e' || z[pos] == u'D' || z[pos] == u'd')) {
        std::size_t p = pos + 1;
        std::string exponent = "e";
        if (p < z.size() && (z[p] == u'+' || z[p] == u'-'))
            exponent += char(z[p++]);
        if (p < z.size() && IstZiffer(z[p])) {
            for (; p < z.size() && IstZiffer(z[p]); ++p)
                exponent += char(z[p]);
            zahl += exponent;
        }
    }
    const char *anfang = zahl.data();
    if (*anfang == '+')
        ++anfang;   // from_chars does not take a plus sign
    double wert = 0;
    const auto [ende, fehler] = std::from_chars(anfang, zahl.data() + zahl.size(), wert);
    (void)ende;
    if (fehler == std::errc::result_out_of_range) {
        // Too large gives infinity (RundeInt16 refuses it), too small gives zero.
        wert = Zehnerpotenz(zahl) > 0 ? HUGE_VAL : 0.0;
        if (zahl[0] == '-')
            wert = -wert;
    }
    return wert;
}

} // namespace

double ZahlWert(const QString &text)
{
    std::u16string z;
    z.reserve(std::size_t(text.size()));
    for (const QChar c : text) {
        if (!IstLeerzeichen(c.unicode()))
            z += c.unicode();
    }
    if (z.size() >= 2 && z[0] == u'&') {
        if (z[1] == u'H' || z[1] == u'h')
            return GanzeZahl(z, 2, 16);
        if (z[1] == u'O' || z[1] == u'o')
            return GanzeZahl(z, 2, 8);
    }
    return Dezimalzahl(z);
}

std::optional<int16_t> RundeInt16(double wert)
{
    if (!std::isfinite(wert))
        return std::nullopt;
    double gerundet = std::floor(wert);
    const double rest = wert - gerundet;
    if (rest > 0.5 || (rest == 0.5 && std::fmod(gerundet, 2.0) != 0.0))
        gerundet += 1.0;
    if (gerundet < -32768.0 || gerundet > 32767.0)
        return std::nullopt;
    return static_cast<int16_t>(gerundet);
}

int16_t RundeInt16OderFehler(double wert)
{
    const auto ergebnis = RundeInt16(wert);
    if (!ergebnis)
        throw Laufzeitfehler("Überlauf");
    return *ergebnis;
}

int16_t Int16Summe(int a, int b)
{
    const long long summe = static_cast<long long>(a) + b;
    if (summe < -32768 || summe > 32767)
        throw Laufzeitfehler("Überlauf");
    return static_cast<int16_t>(summe);
}
