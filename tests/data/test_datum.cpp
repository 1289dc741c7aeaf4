#include "data/Datum.h"

#include "data/Werte.h"

#include <gtest/gtest.h>

TEST(LeseDatum, KurzeUndLangeFormen)
{
    EXPECT_EQ(LeseDatum("3.10.2002"), QDate(2002, 10, 3));
    EXPECT_EQ(LeseDatum("03.10.02"), QDate(2002, 10, 3));
    EXPECT_EQ(LeseDatum("1.2.03"), QDate(2003, 2, 1));
    EXPECT_EQ(LeseDatum(" \t24.12.2002 \t"), QDate(2002, 12, 24));
    EXPECT_EQ(LeseDatum("29.2.2004"), QDate(2004, 2, 29));
    EXPECT_EQ(LeseDatum("1.1.0001"), QDate(1, 1, 1));
    EXPECT_EQ(LeseDatum("31.12.9999"), QDate(9999, 12, 31));
}

TEST(LeseDatum, ZweistelligeJahreWechselnBei30)
{
    EXPECT_EQ(LeseDatum("1.1.00"), QDate(2000, 1, 1));
    EXPECT_EQ(LeseDatum("1.1.29"), QDate(2029, 1, 1));
    EXPECT_EQ(LeseDatum("1.1.30"), QDate(1930, 1, 1));
    EXPECT_EQ(LeseDatum("1.1.99"), QDate(1999, 1, 1));
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
    EXPECT_EQ(LeseDatumOderFehler("1.2.2003"), QDate(2003, 2, 1));
}

TEST(DatumText, ImmerZweistelligUndVierstellig)
{
    EXPECT_EQ(DatumText(QDate(2002, 10, 3)), "03.10.2002");
    EXPECT_EQ(DatumText(QDate(999, 1, 9)), "09.01.0999");
    EXPECT_EQ(DatumText(QDate()), "");
    EXPECT_EQ(DatumText(*LeseDatum("1.8.02")), "01.08.2002");
}

TEST(WochentagVon, SonntagIstEins)
{
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 22)), 1);   // Sonntag
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 23)), 2);
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 25)), 4);   // Mittwoch
    EXPECT_EQ(WochentagVon(QDate(2002, 12, 28)), 7);   // Samstag
}
