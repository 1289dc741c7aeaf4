#include "data/Cp1252.h"

#include <gtest/gtest.h>

TEST(Cp1252, JedesByteKommtUnveraendertZurueck)
{
    QByteArray alle;
    for (int b = 0; b < 256; ++b)
        alle.append(char(b));
    const QString text = DekodiereCp1252(alle);
    ASSERT_EQ(text.size(), 256);
    EXPECT_TRUE(IstCp1252(text));
    QByteArray zurueck;
    ASSERT_TRUE(KodiereCp1252(text, zurueck));
    EXPECT_EQ(zurueck, alle);
}

TEST(Cp1252, ZeichenDieVonLatin1Abweichen)
{
    struct Fall {
        char16_t zeichen;
        unsigned char byte;
    };
    for (const Fall f : {Fall{u'€', 0x80}, Fall{u'‚', 0x82}, Fall{u'„', 0x84}, Fall{u'…', 0x85},
                         Fall{u'Š', 0x8A}, Fall{u'Ž', 0x8E}, Fall{u'‘', 0x91}, Fall{u'“', 0x93},
                         Fall{u'”', 0x94}, Fall{u'–', 0x96}, Fall{u'—', 0x97}, Fall{u'™', 0x99},
                         Fall{u'Ÿ', 0x9F}, Fall{u'ä', 0xE4}, Fall{u'ö', 0xF6}, Fall{u'ü', 0xFC},
                         Fall{u'ß', 0xDF}, Fall{u'Ä', 0xC4}, Fall{u'\u00a0', 0xA0}}) {
        const char byte = char(f.byte);
        EXPECT_EQ(DekodiereCp1252(&byte, 1), QString(QChar(f.zeichen))) << int(f.byte);
        QByteArray kodiert;
        ASSERT_TRUE(KodiereCp1252(QString(QChar(f.zeichen)), kodiert));
        EXPECT_EQ(kodiert, QByteArray(1, byte)) << int(f.byte);
    }
    QByteArray satz;
    ASSERT_TRUE(KodiereCp1252(QString::fromUtf8("„Grüße“ – 5 €"), satz));
    EXPECT_EQ(satz, QByteArray("\x84Gr\xfc\xdf" "e\x93 \x96 5 \x80"));
}

TEST(Cp1252, UndefinierteBytesSindSteuerzeichen)
{
    for (unsigned char b : {0x81, 0x8D, 0x8F, 0x90, 0x9D}) {
        const char byte = char(b);
        EXPECT_EQ(DekodiereCp1252(&byte, 1), QString(QChar(char16_t(b))));
    }
}

TEST(Cp1252, ZeichenAusserhalbScheitern)
{
    // U+0080 and U+009F are Latin-1 controls whose bytes mean € and Ÿ here.
    for (const QString &text : {QString::fromUtf8("Ж"), QString(QChar(0x80)), QString(QChar(0x9F)),
                                QString::fromUtf8("€uro ✓"), QString::fromUtf8("😀"), QString(QChar(0xD800))}) {
        EXPECT_FALSE(IstCp1252(text)) << text.toStdString();
        QByteArray ziel("vorher");
        EXPECT_FALSE(KodiereCp1252(text, ziel));
        EXPECT_TRUE(ziel.startsWith("vorher"));
    }
    EXPECT_FALSE(IstCp1252(QChar(0x20AD)));
    EXPECT_TRUE(IstCp1252(QChar(0x20AC)));
}
