#include "data/Cp1252.h"

#include <gtest/gtest.h>

#include <iterator>

// 0x80..0x9F, where the code page differs from Latin-1; the five undefined bytes stay controls.
constexpr char16_t Bereich80[] = u"€\u0081‚ƒ„…†‡ˆ‰Š‹Œ\u008DŽ\u008F\u0090‘’“”•–—˜™š›œ\u009DžŸ";

TEST(Cp1252, JedesByteHatSeinZeichenUndKommtUnveraendertZurueck)
{
    static_assert(std::size(Bereich80) == 33);
    QByteArray alle;
    for (int b = 0; b < 256; ++b)
        alle.append(char(b));
    const QString text = DekodiereCp1252(alle);
    ASSERT_EQ(text.size(), 256);
    for (int b = 0; b < 256; ++b) {
        const char16_t erwartet = b >= 0x80 && b < 0xA0 ? Bereich80[b - 0x80] : char16_t(b);
        EXPECT_EQ(text[b].unicode(), erwartet) << b;
        QByteArray einzeln;
        ASSERT_TRUE(KodiereCp1252(QString(QChar(erwartet)), einzeln)) << b;
        EXPECT_EQ(einzeln, alle.mid(b, 1)) << b;
    }
    EXPECT_TRUE(IstCp1252(text));
    QByteArray zurueck;
    ASSERT_TRUE(KodiereCp1252(text, zurueck));
    EXPECT_EQ(zurueck, alle);
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
