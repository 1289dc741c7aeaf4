#pragma once

#include <QString>

#include <cstdint>
#include <optional>
#include <stdexcept>

// A run-time failure inside a command (a text that is no date, a 16-bit overflow, an index
// outside a table). Commands catch it and show their own fixed message.
class Laufzeitfehler : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

// The leading-number rule for typed numbers: blanks, tabs and line feeds anywhere are ignored,
// then the longest prefix that forms a number is taken (sign, digits, one '.', exponent E or D;
// &H / &O for hexadecimal / octal whole numbers). No number reads as 0.
// "3 Minis" -> 3, "1 2" -> 12, "2,5" -> 2, "drei" -> 0.
double ZahlWert(const QString &text);

// Nearest whole number, halves to the even neighbour, as a 16-bit value; nothing when the
// result lies outside -32768..32767 (or the value is not finite).
std::optional<int16_t> RundeInt16(double wert);

// The same, throwing Laufzeitfehler on overflow: for code that reports any failure in one place.
int16_t RundeInt16OderFehler(double wert);

// 16-bit arithmetic that throws Laufzeitfehler when it leaves the range.
int16_t Int16Summe(int a, int b);
