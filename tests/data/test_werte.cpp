#include "data/Werte.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

TEST(ZahlWert, NimmtDieLaengsteZahlAmAnfang)
{
    const struct {
        const char *text;
        double wert;
    } faelle[] = {
        {"3 Minis", 3}, {"1 2", 12}, {"2,5", 2}, {"drei", 0}, {"", 0}, {"x3", 0}, {"2.5", 2.5}, {"1.2.3", 1.2},
        // Blanks, tabs and line feeds vanish anywhere; a carriage return ends the number.
        {"\t4\n2 ", 42}, {"- 1 . 5 E 1", -15}, {"4\r2", 4}, {" -2.5e1x", -25},
        {"+7", 7}, {".5", 0.5}, {"5.", 5}, {".", 0}, {"-", 0}, {"+-3", 0},
        {"1D2", 100}, {"1d-2", 0.01}, {"2E+1", 20}, {"3E", 3}, {"3E+x", 3}, {"1e-400", 0},
        {"&HFF", 255}, {"&h1g", 1}, {"&O17", 15}, {"&o78", 7}, {"&H", 0}, {"& H 1 0", 16}, {"&X1", 0}, {"&H1.5", 1},
    };
    for (const auto &f : faelle)
        EXPECT_EQ(ZahlWert(QString::fromUtf8(f.text)), f.wert) << f.text;
    EXPECT_TRUE(std::isinf(ZahlWert("1e400")));
    EXPECT_LT(ZahlWert("-1e400"), 0);
    EXPECT_TRUE(std::isinf(ZahlWert(QString(400, u'9'))));
    EXPECT_EQ(ZahlWert("0." + QString(400, u'0') + "1e5"), 0);
}

TEST(RundeInt16, HalbeZurGeradenZahlInnerhalbDer16Bit)
{
    constexpr double inf = std::numeric_limits<double>::infinity();
    const struct {
        double wert;
        std::optional<int16_t> erwartet;
    } faelle[] = {
        {0.5, 0}, {1.5, 2}, {2.5, 2}, {3.5, 4}, {-0.5, 0}, {-1.5, -2}, {-2.5, -2},
        {2.4999999, 2}, {2.5000001, 3}, {-2.6, -3},
        {32767.4, 32767}, {32766.5, 32766}, {32767.5, std::nullopt}, {-32768.5, -32768},
        {-32768.51, std::nullopt}, {1e300, std::nullopt}, {inf, std::nullopt},
        {std::numeric_limits<double>::quiet_NaN(), std::nullopt},
    };
    for (const auto &f : faelle)
        EXPECT_EQ(RundeInt16(f.wert), f.erwartet) << f.wert;
    EXPECT_THROW(RundeInt16OderFehler(40000), Laufzeitfehler);
    EXPECT_EQ(RundeInt16OderFehler(-7.5), -8);

    EXPECT_EQ(Int16Summe(32766, 1), 32767);
    EXPECT_EQ(Int16Summe(-32767, -1), -32768);
    EXPECT_THROW(Int16Summe(32767, 1), Laufzeitfehler);
    EXPECT_THROW(Int16Summe(-32768, -1), Laufzeitfehler);
}
