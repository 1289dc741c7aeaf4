#include "druck/AufzeichnenderDrucker.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include "data/InitMini.h"
#include "output/Druckauftrag.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <utility>

// Page 1000 x 2000, so L = 100 and T = 50; size 10 gives H = 20 and with spacing 1 a line step
// of 20. Widths: 10 per character at size 10.

namespace {

Mini NeuerMini(const QString &name, const QString &vorname, const QString &strasse, const QString &telefon,
               bool omi = false)
{
    Mini m;
    m.Name = name;
    m.Vorname = vorname;
    m.Strasse = strasse;
    m.Telefon = telefon;
    m.Oberministrant = omi;
    return m;
}

PlanEintrag NeuerEintrag(const QString &datum, const QString &zeit,
                         std::initializer_list<std::pair<QString, QString>> minis)
{
    PlanEintrag e;
    e.Datum = datum;
    e.Wochentag = QStringLiteral("Sonntag");
    e.Zeit = zeit;
    for (const auto &[vorname, name] : minis) {
        e.Vorname[e.MiniAnz] = vorname;
        e.Name[e.MiniAnz] = name;
        ++e.MiniAnz;
    }
    return e;
}

class DruckauftragTest : public ::testing::Test
{
protected:
    void setzeMinis(std::vector<Mini> minis)
    {
        d.AnzahlMinis = int16_t(minis.size());
        d.Minis = std::move(minis);
        d.Minis.emplace_back();
    }
    void setzePlan(std::vector<PlanEintrag> plan)
    {
        d.AnzahlPlanEintraege = int16_t(plan.size());
        d.Plan = std::move(plan);
        d.Plan.emplace_back();
    }
    DruckErgebnis drucke() { return Druckauftrag(dr, d, meldungen, uhr).fuehreAus(e); }

    // Drawn texts of the plan part: everything after the plan title.
    std::vector<AufzeichnenderDrucker::Aufruf> planTexte() const
    {
        std::vector<AufzeichnenderDrucker::Aufruf> t;
        bool imPlan = false;
        for (const auto &a : dr.texte()) {
            imPlan = imPlan || a.text.startsWith(QLatin1String("Ministrantenplan vom"));
            if (imPlan)
                t.push_back(a);
        }
        return t;
    }

    InitMini d;
    AufzeichnenderDrucker dr;
    TestMeldungen meldungen;
    TestUhr uhr;
    DruckEinstellungen e{QStringLiteral("Times"), QStringLiteral("10"), QStringLiteral("1"), true, true};
};

// --- preparation ---------------------------------------------------------------------------

TEST_F(DruckauftragTest, PreparationSetsUnitFontAllSizesThenTheChosenOneAndOpensThePage)
{
    e.schriftgroesse = QStringLiteral("10.5");
    ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);

    const auto &a = dr.aufrufe;
    ASSERT_GE(a.size(), 17u);
    EXPECT_EQ(a[0].art, "setzeEinheitPixel");
    EXPECT_EQ(a[1].art, "setzeSchriftName");
    EXPECT_EQ(a[1].text, "Times");
    for (int s = 8; s <= 20; ++s) {
        EXPECT_EQ(a[2 + s - 8].art, "setzeSchriftGroesse");
        EXPECT_EQ(a[2 + s - 8].groesse, s);
    }
    EXPECT_EQ(a[15].groesse, 10.5);
    EXPECT_EQ(a[16].art, "druckeZeile");
    EXPECT_EQ(a[16].text, "");
    EXPECT_TRUE(meldungen.gezeigt().empty());
    EXPECT_EQ(e.schriftgroesse, "10.5");
}

TEST_F(DruckauftragTest, SizeOutsideEightToTwentyIsCorrectedToTenWithAMessage)
{
    for (const char *text : {"21", "7.5", "", "zehn", "1e9", "-12"}) {
        SCOPED_TRACE(text);
        AufzeichnenderDrucker neu;
        dr = neu;
        meldungen.leeren();
        e.schriftgroesse = QString::fromUtf8(text);
        ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
        ASSERT_EQ(meldungen.gezeigt().size(), 1u);
        const auto &m = meldungen.gezeigt()[0];
        EXPECT_EQ(m.text, QStringLiteral("Schriftgröße nicht durchführbar! Korrigiere auf 10."));
        EXPECT_EQ(m.titel, QStringLiteral("Falsche Schriftgröße"));
        EXPECT_EQ(m.symbol, Symbol::Ausrufezeichen);
        EXPECT_EQ(m.knoepfe, Knoepfe::OK);
        EXPECT_EQ(e.schriftgroesse, "10");
        EXPECT_EQ(dr.aufrufe[15].groesse, 10);
    }
}

TEST_F(DruckauftragTest, SizesEightAndTwentyAndLeadingNumbersAreAccepted)
{
    for (auto [text, wert] : {std::pair{"8", 8.0}, {"20", 20.0}, {" 12 pt", 12.0}}) {
        SCOPED_TRACE(text);
        AufzeichnenderDrucker neu;
        dr = neu;
        e.schriftgroesse = QString::fromUtf8(text);
        drucke();
        EXPECT_TRUE(meldungen.gezeigt().empty());
        EXPECT_EQ(e.schriftgroesse, QString::fromUtf8(text));
        EXPECT_EQ(dr.aufrufe[15].groesse, wert);
    }
}

TEST_F(DruckauftragTest, SpacingTextSetsTheLineStep)
{
    setzeMinis({NeuerMini("A", "B", "C", "D")});
    for (auto [text, ersteZeile] : {std::pair{"1.5", 50.0 + 2 * 30}, {"1,5", 50.0 + 2 * 20}, {"2", 50.0 + 2 * 40}}) {
        SCOPED_TRACE(text);
        AufzeichnenderDrucker neu;
        dr = neu;
        e.zeilenabstand = QString::fromUtf8(text);
        drucke();
        EXPECT_EQ(dr.gedruckt("A").y, ersteZeile);
    }
}

TEST_F(DruckauftragTest, EmptyJobEndsADocumentOfOnePageHoldingOnlyTheEmptyLines)
{
    e.adressliste = false;
    e.plan = false;
    setzeMinis({NeuerMini("A", "B", "C", "D")});
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}})});
    ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
    EXPECT_TRUE(dr.texte().empty());
    EXPECT_EQ(dr.anzahl("druckeZeile"), 2);  // preparation and before the plan
    EXPECT_EQ(dr.anzahl("neueSeite"), 0);
    EXPECT_EQ(dr.anzahl("beendeDokument"), 1);
    EXPECT_EQ(dr.seiten, 1);
    EXPECT_TRUE(meldungen.gezeigt().empty());
}

// --- address list --------------------------------------------------------------------------

class AdresslisteTest : public DruckauftragTest
{
protected:
    void SetUp() override
    {
        e.plan = false;
        Mini ott = NeuerMini("Ott", "Christian", "", "9");
        ott.NichtEinteilen = true;
        setzeMinis({NeuerMini("Bauer", "Anna", "Hauptstr. 1", "123"),
                    NeuerMini("Schmidt-Langname", "Bo", "Weg 2", "4567", true), ott});
    }
};

TEST_F(AdresslisteTest, FourAlignedColumnsTitleWithDateAndHeadServersLast)
{
    ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
    const auto titel = dr.gedruckt(QStringLiteral("Adressverzeichnis aller Ministranten  (Stand 05.12.2026)"));
    EXPECT_EQ(titel.x, 100);
    EXPECT_EQ(titel.y, 50);
    EXPECT_TRUE(titel.fett);

    // wN = 18 x 10 ("Schmidt-Langname  "), wV = 110, wS = 130.
    const double spalten[] = {100, 280, 390, 520};
    const QStringList bauer{"Bauer", "Anna", "Hauptstr. 1", "123"};
    const QStringList ott{"Ott", "Christian", "", "9"};
    const QStringList schmidt{"Schmidt-Langname", "Bo", "Weg 2", "4567"};
    for (int s = 0; s < 4; ++s) {
        EXPECT_EQ(dr.gedruckt(bauer[s]).x, spalten[s]);
        EXPECT_EQ(dr.gedruckt(bauer[s]).y, 90);    // one empty line below the title
        EXPECT_FALSE(dr.gedruckt(bauer[s]).fett);
        EXPECT_EQ(dr.gedruckt(ott[s]).y, 110);
        EXPECT_EQ(dr.gedruckt(schmidt[s]).x, spalten[s]);
        EXPECT_EQ(dr.gedruckt(schmidt[s]).y, 190);
    }
    const auto kopf = dr.gedruckt(QStringLiteral("Oberministranten"));
    EXPECT_EQ(kopf.x, 100);
    EXPECT_EQ(kopf.y, 150);                          // two line steps below the last row
    EXPECT_TRUE(kopf.fett);
    EXPECT_EQ(dr.anzahl("neueSeite"), 0);            // no plan asked for
    EXPECT_EQ(dr.seiten, 1);
}

TEST_F(AdresslisteTest, OnlyHeadServersGiveTheHeadingThreeStepsBelowTheTitle)
{
    for (auto &m : d.Minis)
        m.Oberministrant = true;
    drucke();
    EXPECT_EQ(dr.gedruckt("Oberministranten").y, 50 + 3 * 20);
    EXPECT_EQ(dr.gedruckt("Bauer").y, 150);        // one empty line below the heading
}

TEST_F(AdresslisteTest, WithoutHeadServersTheHeadingEndsTheList)
{
    d.Minis[1].Oberministrant = false;
    drucke();
    const auto texte = dr.texte();
    EXPECT_EQ(texte.back().text, "Oberministranten");
    EXPECT_EQ(texte.back().y, 130 + 40);
}

TEST_F(AdresslisteTest, PlanFollowsOnANewPage)
{
    e.plan = true;
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}})});
    drucke();
    const auto titel = dr.gedruckt("Ministrantenplan vom 03.01.2027 bis 03.01.2027");
    EXPECT_EQ(titel.seite, 2);
    EXPECT_EQ(titel.y, 50);
    EXPECT_EQ(dr.seiten, 2);
}

TEST_F(AdresslisteTest, TooWideColumnsAreRefusedAndThePlanStartsOnTheFirstPage)
{
    // 1200 wide: A = 960; size 20. No row needs more than 22 + 3 + 3 + 3 characters, but the
    // widest entries of the four columns add up to 22 + 22 + 3 + 3 characters = 1000.
    AufzeichnenderDrucker breit(1200, 2000);
    dr = breit;
    e.plan = true;
    e.schriftgroesse = QStringLiteral("20");
    setzeMinis({NeuerMini("Aaaaaaaaaaaaaaaaaaaa", "B", "C", "D"), NeuerMini("E", "Ffffffffffffffffffff", "G", "H")});
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}})});

    ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    const auto &m = meldungen.gezeigt()[0];
    EXPECT_EQ(m.text, QStringLiteral("Adressliste kann nicht gedruckt werden, da die Schrift zu groß gewählt wurde!"));
    EXPECT_EQ(m.titel, "Fehler beim Drucken");
    EXPECT_EQ(m.symbol, Symbol::Kritisch);
    EXPECT_EQ(dr.gedruckt("Aaaaaaaaaaaaaaaaaaaa").art, "");
    EXPECT_EQ(dr.anzahl("neueSeite"), 1);              // only the plan's own last one
    const auto titel = dr.texte().front();
    EXPECT_TRUE(titel.text.startsWith("Ministrantenplan vom"));
    EXPECT_EQ(titel.seite, 1);
    EXPECT_EQ(titel.y, 50);
    EXPECT_EQ(dr.seiten, 1);
}

TEST_F(AdresslisteTest, ColumnsExactlyFillingTheWidthArePrinted)
{
    // 18 + 11 + 13 + 6 characters = 480 = 600 - 2 x 60.
    AufzeichnenderDrucker schmal(600, 2000);
    dr = schmal;
    drucke();
    EXPECT_TRUE(meldungen.gezeigt().empty());
    EXPECT_EQ(dr.gedruckt("Bauer").x, 60);
}

TEST_F(AdresslisteTest, RowsBreakTwoTopMarginsAboveTheBottomAndKeepTheirColumns)
{
    std::vector<Mini> minis;
    for (int i = 0; i < 100; ++i)
        minis.push_back(NeuerMini(QStringLiteral("N%1").arg(i, 3, 10, QLatin1Char('0')), "V", "S", "T"));
    minis.back().Name = QStringLiteral("Langer Familienname");
    setzeMinis(minis);
    drucke();

    // Rows at 90 + 20k; row k stays while its predecessor + 40 <= 2000 - 100.
    EXPECT_EQ(dr.gedruckt("N089").y, 1870);
    EXPECT_EQ(dr.gedruckt("N089").seite, 1);
    const auto umbruch = dr.gedruckt("N090");
    EXPECT_EQ(umbruch.seite, 2);
    EXPECT_EQ(umbruch.y, 50);
    EXPECT_EQ(umbruch.x, 100);
    EXPECT_EQ(dr.gedruckt("N091").y, 70);
    // The longest family name, in the last row, sets the first-name column on both pages.
    EXPECT_EQ(dr.gedruckt("V", 1).x, 100 + 210);
    EXPECT_EQ(dr.gedruckt("V", 95).x, 100 + 210);
    EXPECT_EQ(dr.gedruckt("Langer Familienname").seite, 2);

    // A new page is opened by the empty line directly after it.
    for (size_t i = 0; i < dr.aufrufe.size(); ++i) {
        if (dr.aufrufe[i].art == "neueSeite") {
            ASSERT_LT(i + 1, dr.aufrufe.size());
            EXPECT_EQ(dr.aufrufe[i + 1].art, "druckeZeile");
        }
    }
}

TEST_F(AdresslisteTest, HeadServerHeadingUsesTheWholePageButMustEndOnIt)
{
    // Size 20 with spacing 2.5: H = 40, step 100. Twenty rows, then one head server.
    e.schriftgroesse = QStringLiteral("20");
    e.zeilenabstand = QStringLiteral("2.5");
    std::vector<Mini> minis;
    for (int i = 0; i < 20; ++i)
        minis.push_back(NeuerMini(QStringLiteral("N%1").arg(i), "V", "S", "T"));
    minis.push_back(NeuerMini("Omi", "V", "S", "T", true));
    setzeMinis(minis);
    {
        // 2400 high, T = 60: the last row at 2160, the heading at 2360 ends on the edge.
        AufzeichnenderDrucker hoch(1000, 2400);
        dr = hoch;
        drucke();
        EXPECT_EQ(dr.gedruckt("N19").y, 2160);
        const auto kopf = dr.gedruckt("Oberministranten");
        EXPECT_EQ(kopf.seite, 1);
        EXPECT_EQ(kopf.y, 2360);
        EXPECT_EQ(dr.gedruckt("Omi").seite, 2);
    }
    {
        // 2380 high, T = 59.5: all rows still fit (2059.5 + 200 <= 2261), but a heading at
        // 2359.5 would run 19.5 past the edge, so it opens a new page.
        AufzeichnenderDrucker hoch(1000, 2380);
        dr = hoch;
        drucke();
        EXPECT_EQ(dr.gedruckt("N19").y, 2159.5);
        EXPECT_EQ(dr.gedruckt("N19").seite, 1);
        const auto kopf = dr.gedruckt("Oberministranten");
        EXPECT_EQ(kopf.seite, 2);
        EXPECT_EQ(kopf.y, 59.5);
        EXPECT_EQ(kopf.x, 100);
        EXPECT_TRUE(kopf.fett);
        EXPECT_EQ(dr.gedruckt("Omi").y, 259.5);
    }
}

// --- plan ----------------------------------------------------------------------------------

class PlanTest : public DruckauftragTest
{
protected:
    void SetUp() override
    {
        e.adressliste = false;
        setzeMinis({NeuerMini("A", "B", "C", "D")});
    }
};

TEST_F(PlanTest, TitleBoldHeadingsItalicFirstServerOnTheHeadingsLine)
{
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}, {"Bo", "Schmidt"}, {"Cem", "Ott"}}),
               NeuerEintrag("04.01.2027", "9.30", {}),
               NeuerEintrag("05.01.2027", "", {{"", ""}})});
    ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);

    const auto t = planTexte();
    ASSERT_EQ(t.size(), 1u + 4 + 1 + 2);
    EXPECT_EQ(t[0].text, "Ministrantenplan vom 03.01.2027 bis 05.01.2027");
    EXPECT_EQ(t[0].x, 100);
    EXPECT_EQ(t[0].y, 50);
    EXPECT_TRUE(t[0].fett);

    // C = width of the widest heading: "Sonntag, den 04.01.2027, 9.30 Uhr: " is 35 characters,
    // the others 36 and 31.
    const double spalte = 100 + 360;
    EXPECT_EQ(t[1].text, "Sonntag, den 03.01.2027, 10:00 Uhr: ");
    EXPECT_EQ(t[1].x, 100);
    EXPECT_EQ(t[1].y, 110);                            // three line steps below the title
    EXPECT_TRUE(t[1].kursiv);
    EXPECT_FALSE(t[1].fett);
    const char *namen[] = {"Anna Bauer", "Bo Schmidt", "Cem Ott"};
    for (int k = 0; k < 3; ++k) {
        EXPECT_EQ(t[2 + k].text, namen[k]);
        EXPECT_EQ(t[2 + k].x, spalte);
        EXPECT_EQ(t[2 + k].y, 110 + 20 * k);
        EXPECT_FALSE(t[2 + k].kursiv);
    }
    // An empty line after the three names; the entry without servers takes one line.
    EXPECT_EQ(t[5].text, "Sonntag, den 04.01.2027, 9.30 Uhr: ");
    EXPECT_EQ(t[5].y, 190);
    EXPECT_EQ(t[6].text, "Sonntag, den 05.01.2027,  Uhr: ");
    EXPECT_EQ(t[6].y, 210);
    EXPECT_EQ(t[7].text, " ");                         // an unfilled place
    EXPECT_EQ(t[7].x, spalte);

    // The plan ends with a new page that adds no sheet.
    EXPECT_EQ(dr.aufrufe[dr.aufrufe.size() - 2].art, "neueSeite");
    EXPECT_EQ(dr.aufrufe.back().art, "beendeDokument");
    EXPECT_EQ(dr.seiten, 1);
}

TEST_F(PlanTest, AnEntryThatDoesNotFitStartsANewPageAtTheTopWithoutTitle)
{
    // Entries of three servers take 4 line steps; each block plus the empty line 100.
    std::vector<PlanEintrag> plan;
    for (int i = 0; i < 25; ++i)
        plan.push_back(NeuerEintrag(QStringLiteral("%1.01.2027").arg(i + 1, 2, 10, QLatin1Char('0')), "10",
                                    {{"A", "B"}, {"C", "D"}, {"E", "F"}}));
    setzePlan(plan);
    drucke();

    // Headings at 110 + 80i; entry 23 at 1950: 1950 + 80 > 2000.
    const auto heading = [&](int i) {
        return dr.gedruckt(QStringLiteral("Sonntag, den %1.01.2027, 10 Uhr: ").arg(i + 1, 2, 10, QLatin1Char('0')));
    };
    EXPECT_EQ(heading(22).y, 1870);
    EXPECT_EQ(heading(22).seite, 1);
    EXPECT_EQ(heading(23).seite, 2);
    EXPECT_EQ(heading(23).y, 50);
    EXPECT_EQ(heading(24).y, 130);
    EXPECT_EQ(dr.anzahl("drucke") - 25 * 4, 1);        // one title only
    EXPECT_EQ(dr.seiten, 2);
}

TEST_F(PlanTest, ABlockEndingExactlyOnThePageBottomStaysOnThePage)
{
    // 1000 x 800: T = 20, headings start at 80. 35 servers need 36 steps: 80 + 720 = 800.
    for (int anzahl : {35, 36}) {
        SCOPED_TRACE(anzahl);
        AufzeichnenderDrucker klein(1000, 800);
        dr = klein;
        PlanEintrag lang = NeuerEintrag("01.01.2027", "1", {});
        for (int k = 0; k < anzahl; ++k)
            lang.Vorname[k] = QStringLiteral("M%1").arg(k);
        lang.MiniAnz = int16_t(anzahl);
        setzePlan({lang, NeuerEintrag("02.01.2027", "2", {})});
        drucke();
        const auto kopf = dr.gedruckt("Sonntag, den 01.01.2027, 1 Uhr: ");
        const auto zweiter = dr.gedruckt("Sonntag, den 02.01.2027, 2 Uhr: ");
        if (anzahl == 35) {
            EXPECT_EQ(kopf.seite, 1);
            EXPECT_EQ(kopf.y, 80);
            EXPECT_EQ(dr.gedruckt("M34 ").y, 760);
            EXPECT_EQ(zweiter.seite, 2);   // 800 + 20 > 800
            EXPECT_EQ(zweiter.y, 20);
        } else {
            EXPECT_EQ(kopf.seite, 2);
            EXPECT_EQ(kopf.y, 20);
            EXPECT_EQ(dr.gedruckt("M0 ").y, 20);
        }
    }
}

TEST_F(PlanTest, TooWideTitleOrServerLineRefusesThePlan)
{
    const auto pruefe = [&](const char *fall) {
        SCOPED_TRACE(fall);
        ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
        ASSERT_EQ(meldungen.gezeigt().size(), 1u);
        EXPECT_EQ(meldungen.gezeigt()[0].text,
                  QStringLiteral("Plan kann nicht gedruckt werden, da die Schrift zu groß gewählt wurde!"));
        EXPECT_EQ(meldungen.gezeigt()[0].titel, "Fehler beim Drucken");
        EXPECT_EQ(meldungen.gezeigt()[0].symbol, Symbol::Kritisch);
        EXPECT_TRUE(dr.texte().empty());
        EXPECT_TRUE(dr.beendet);
    };
    {
        // Title: 46 characters x 20 = 920 > 800.
        e.schriftgroesse = QStringLiteral("20");
        setzePlan({NeuerEintrag("03.01.2027", "", {})});
        pruefe("title");
    }
    {
        // Heading 36 + name 44 characters = 800 fits, 45 does not.
        AufzeichnenderDrucker neu;
        dr = neu;
        meldungen.leeren();
        e.schriftgroesse = QStringLiteral("10");
        setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"A", QString(42, QLatin1Char('x'))}})});
        drucke();
        EXPECT_TRUE(meldungen.gezeigt().empty());
        AufzeichnenderDrucker neu2;
        dr = neu2;
        setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}}),
                   NeuerEintrag("04.01.2027", "10:00", {{"A", QString(43, QLatin1Char('x'))}})});
        pruefe("server line");
    }
}

TEST_F(PlanTest, ServicesLongerThanAPageContinueOverleaf)
{
    // 1000 x 400: T = 10, step 20. 25 servers need 520 > 400 even on a fresh page.
    AufzeichnenderDrucker klein(1000, 400);
    dr = klein;
    PlanEintrag gross = NeuerEintrag("03.01.2027", "10", {});
    for (int k = 0; k < 25; ++k) {
        gross.Vorname[k] = QStringLiteral("V%1").arg(k);
        gross.Name[k] = QStringLiteral("N");
    }
    gross.MiniAnz = 25;
    setzePlan({gross});
    drucke();
    // Title at 10, heading at 70 on page 1 would end at 70 + 520; it starts a new page at 10.
    EXPECT_EQ(dr.gedruckt("V0 N").seite, 2);
    EXPECT_EQ(dr.gedruckt("V0 N").y, 10);
    for (int k = 0; k < 25; ++k) {
        const auto z = dr.gedruckt(QStringLiteral("V%1 N").arg(k));
        EXPECT_LE(z.y + 20, 400) << k;
    }
    EXPECT_EQ(dr.gedruckt("V18 N").y, 370);
    EXPECT_EQ(dr.gedruckt("V18 N").seite, 2);
    EXPECT_EQ(dr.gedruckt("V19 N").seite, 3);
    EXPECT_EQ(dr.gedruckt("V19 N").y, 10);
    EXPECT_EQ(dr.gedruckt("V24 N").y, 110);
    EXPECT_EQ(dr.seiten, 3);
}

TEST_F(PlanTest, NoPlanEntriesOrNoServersPrintNothingOfThePlan)
{
    setzePlan({});
    drucke();
    EXPECT_TRUE(dr.texte().empty());
    EXPECT_TRUE(dr.beendet);

    AufzeichnenderDrucker neu;
    dr = neu;
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}})});
    setzeMinis({});
    drucke();
    EXPECT_TRUE(dr.texte().empty());
}

// --- failures of the printer service ---------------------------------------------------------

TEST_F(DruckauftragTest, ServiceFailureMidJobDiscardsTheDocumentWithOneMessage)
{
    setzeMinis({NeuerMini("A", "B", "C", "D")});
    setzePlan({NeuerEintrag("03.01.2027", "10:00", {{"Anna", "Bauer"}})});
    dr.scheitereBei(QStringLiteral("neueSeite"), 1);

    EXPECT_EQ(drucke(), DruckErgebnis::Fehlgeschlagen);
    EXPECT_TRUE(dr.verworfen);
    EXPECT_FALSE(dr.beendet);
    EXPECT_EQ(dr.gedruckt("Anna Bauer").art, "");      // the plan was never reached
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    EXPECT_EQ(meldungen.gezeigt()[0].titel, "Fehler beim Drucken");
    EXPECT_EQ(meldungen.gezeigt()[0].symbol, Symbol::Kritisch);
    EXPECT_EQ(meldungen.gezeigt()[0].knoepfe, Knoepfe::OK);
}

TEST_F(DruckauftragTest, FailureWhenEndingOrWritingTheFile)
{
    dr.scheitereBei(QStringLiteral("beendeDokument"), 1);
    EXPECT_EQ(drucke(), DruckErgebnis::Fehlgeschlagen);
    EXPECT_TRUE(dr.verworfen);

    AufzeichnenderDrucker neu;
    dr = neu;
    meldungen.leeren();
    dr.scheitereBei(QStringLiteral("beendeDokument"), 1, DruckerFehler::Art::Datei);
    EXPECT_EQ(drucke(), DruckErgebnis::DateiNichtGeschrieben);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    EXPECT_EQ(meldungen.gezeigt()[0].text, "Datei /x/PLAN.PDF konnte nicht geschrieben werden.");
    EXPECT_EQ(meldungen.gezeigt()[0].titel, "Als PDF speichern");
    EXPECT_EQ(meldungen.gezeigt()[0].symbol, Symbol::Kritisch);
}

TEST_F(DruckauftragTest, ServiceCountBeyondTheNameSlotsIsAFailureNotACrash)
{
    setzeMinis({NeuerMini("A", "B", "C", "D")});
    PlanEintrag kaputt = NeuerEintrag("03.01.2027", "10:00", {});
    kaputt.MiniAnz = 42;
    setzePlan({kaputt});
    EXPECT_EQ(drucke(), DruckErgebnis::Fehlgeschlagen);
    EXPECT_TRUE(dr.verworfen);
}

} // namespace
