#include "data/Werte.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

TEST(ZahlWert, NimmtDieLaengsteZahlAmAnfang)
{
    EXPECT_EQ(ZahlWert("3 Minis"), 3);
    EXPECT_EQ(ZahlWert("1 2"), 12);
    EXPECT_EQ(ZahlWert("2,5"), 2);
    EXPECT_EQ(ZahlWert("drei"), 0);
    EXPECT_EQ(ZahlWert(""), 0);
    EXPECT_EQ(ZahlWert(" -2.5e1x"), -25);
    EXPECT_EQ(ZahlWert("2.5"), 2.5);
    EXPECT_EQ(ZahlWert("1.2.3"), 1.2);
    EXPECT_EQ(ZahlWert("x3"), 0);
}

TEST(ZahlWert, IgnoriertLeerzeichenTabulatorUndZeilenvorschubUeberall)
{
    EXPECT_EQ(ZahlWert("\t4\n2 "), 42);
    EXPECT_EQ(ZahlWert("- 1 . 5 E 1"), -15);
    // A carriage return is no blank: it ends the number.
    EXPECT_EQ(ZahlWert("4\r2"), 4);
}

TEST(ZahlWert, VorzeichenKommaUndExponent)
{
    EXPECT_EQ(ZahlWert("+7"), 7);
    EXPECT_EQ(ZahlWert(".5"), 0.5);
    EXPECT_EQ(ZahlWert("5."), 5);
    EXPECT_EQ(ZahlWert("."), 0);
    EXPECT_EQ(ZahlWert("-"), 0);
    EXPECT_EQ(ZahlWert("+-3"), 0);
    EXPECT_EQ(ZahlWert("1D2"), 100);
    EXPECT_EQ(ZahlWert("1d-2"), 0.01);
    EXPECT_EQ(ZahlWert("2E+1"), 20);
    // An exponent without digits is not part of the number.
    EXPECT_EQ(ZahlWert("3E"), 3);
    EXPECT_EQ(ZahlWert("3E+x"), 3);
    EXPECT_TRUE(std::isinf(ZahlWert("1e400")));
    EXPECT_LT(ZahlWert("-1e400"), 0);
    EXPECT_EQ(ZahlWert("1e-400"), 0);
    EXPECT_TRUE(std::isinf(ZahlWert(QString(400, u'9'))));
    EXPECT_EQ(ZahlWert("0." + QString(400, u'0') + "1e5"), 0);
}

TEST(ZahlWert, HexadezimalUndOktal)
{
    EXPECT_EQ(ZahlWert("&HFF"), 255);
    EXPECT_EQ(ZahlWert("&h1g"), 1);
    EXPECT_EQ(ZahlWert("&O17"), 15);
    EXPECT_EQ(ZahlWert("&o78"), 7);
    EXPECT_EQ(ZahlWert("&H"), 0);
    EXPECT_EQ(ZahlWert("& H 1 0"), 16);
    EXPECT_EQ(ZahlWert("&X1"), 0);
    EXPECT_EQ(ZahlWert("&H1.5"), 1);
}

TEST(RundeInt16, HalbeZurGeradenZahl)
{
    EXPECT_EQ(RundeInt16(0.5), 0);
    EXPECT_EQ(RundeInt16(1.5), 2);
    EXPECT_EQ(RundeInt16(2.5), 2);
    EXPECT_EQ(RundeInt16(3.5), 4);
    EXPECT_EQ(RundeInt16(-0.5), 0);
    EXPECT_EQ(RundeInt16(-1.5), -2);
    EXPECT_EQ(RundeInt16(-2.5), -2);
    EXPECT_EQ(RundeInt16(2.4999999), 2);
    EXPECT_EQ(RundeInt16(2.5000001), 3);
    EXPECT_EQ(RundeInt16(-2.6), -3);
}

TEST(RundeInt16, Bereichsgrenzen)
{
    EXPECT_EQ(RundeInt16(32767.4), 32767);
    EXPECT_EQ(RundeInt16(32766.5), 32766);
    EXPECT_EQ(RundeInt16(32767.5), std::nullopt);
    EXPECT_EQ(RundeInt16(-32768.5), -32768);
    EXPECT_EQ(RundeInt16(-32768.51), std::nullopt);
    EXPECT_EQ(RundeInt16(1e300), std::nullopt);
    EXPECT_EQ(RundeInt16(std::numeric_limits<double>::infinity()), std::nullopt);
    EXPECT_EQ(RundeInt16(std::numeric_limits<double>::quiet_NaN()), std::nullopt);
    EXPECT_THROW(RundeInt16OderFehler(40000), Laufzeitfehler);
    EXPECT_EQ(RundeInt16OderFehler(-7.5), -8);
}

TEST(Int16Summe, WirftBeimVerlassenDesBereichs)
{
    EXPECT_EQ(Int16Summe(32766, 1), 32767);
    EXPECT_EQ(Int16Summe(-32767, -1), -32768);
    EXPECT_THROW(Int16Summe(32767, 1), Laufzeitfehler);
    EXPECT_THROW(Int16Summe(-32768, -1), Laufzeitfehler);
}
