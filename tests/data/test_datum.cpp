#include "data/Datum.h"

#include "data/Werte.h"

#include <gtest/gtest.h>

TEST(LeseDatum, KurzeUndLangeFormenUndDieJahrhundertgrenze)
{
    const struct {
        const char *text;
        QDate datum;
    } faelle[] = {
        {"3.10.2002", {2002, 10, 3}}, {"03.10.02", {2002, 10, 3}}, {"1.2.03", {2003, 2, 1}},
        {" \t24.12.2002 \t", {2002, 12, 24}}, {"29.2.2004", {2004, 2, 29}}, {"1.1.0001", {1, 1, 1}},
        {"31.12.9999", {9999, 12, 31}}, {"1.1.00", {2000, 1, 1}}, {"1.1.29", {2029, 1, 1}},
        {"1.1.30", {1930, 1, 1}}, {"1.1.99", {1999, 1, 1}},
    };
    for (const auto &f : faelle)
        EXPECT_EQ(LeseDatum(f.text), f.datum) << f.text;
    EXPECT_EQ(LeseDatumOderFehler("1.2.2003"), QDate(2003, 2, 1));
}

TEST(LeseDatum, AllesAndereIstKeinDatum)
{
    for (const char *text : {"", " ", "31.02.2003", "29.2.2003", "0.1.2003", "1.0.2003", "1.13.2003",
                             "32.1.2003", "1.1.0000", "1.1.2", "1.1.200", "1.1.20031", "001.1.2003",
                             "1.001.2003", "1.1.2003x", "x1.1.2003", "1.1.2003.", "1 .1.2003", "1. 1.2003",
                             "1-1-2003", "1/1/2003", "+1.1.2003", "1.1.-03", "1..2003", "1.1.", ".1.2003",
                             "1.1.2003\n", "\u00a01.1.2003", "\u0661.1.2003"}) {
        EXPECT_EQ(LeseDatum(QString::fromUtf8(text)), std::nullopt) << text;
    }
    EXPECT_THROW(LeseDatumOderFehler("31.02.2003"), Laufzeitfehler);
}

TEST(DatumText, ZweistelligVierstelligUndSonntagIstEins)
{
    EXPECT_EQ(DatumText(QDate(2002, 10, 3)), "03.10.2002");
    EXPECT_EQ(DatumText(QDate(999, 1, 9)), "09.01.0999");
    EXPECT_EQ(DatumText(QDate()), "");
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 22)), 1);   // Sonntag
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 23)), 2);
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 28)), 7);   // Samstag
}
