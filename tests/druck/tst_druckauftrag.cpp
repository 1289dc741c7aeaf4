#include "druck/AufzeichnenderDrucker.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include "data/InitMini.h"
#include "output/Druckauftrag.h"

#include <gtest/gtest.h>

#include <tuple>

// Page 1000 x 2000 unless a test says otherwise: L = 100, T = 50. Size 10 gives a line height
// of 20, with spacing 1 also the line step; text is 10 wide per character.

namespace {

using Ort = std::tuple<int, double, double>;   // page, x, y
const QString ZuGross = " kann nicht gedruckt werden, da die Schrift zu groß gewählt wurde!";

// A Sunday service whose servers have the given first names and the family name name.
PlanEintrag E(const QString &datum, const QString &zeit, const QStringList &vornamen = {}, const QString &name = "N")
{
    PlanEintrag e;
    e.Datum = datum;
    e.Wochentag = "Sonntag";
    e.Zeit = zeit;
    for (; e.MiniAnz < vornamen.size(); ++e.MiniAnz) {
        e.Vorname[e.MiniAnz] = vornamen[e.MiniAnz];
        e.Name[e.MiniAnz] = name;
    }
    return e;
}

class DruckauftragTest : public ::testing::Test
{
protected:
    // Servers as {Name, Vorname, Strasse, Telefon}; missing fields are "V", "S" and "T".
    void minis(const std::vector<QStringList> &zeilen)
    {
        d.AnzahlMinis = int16_t(zeilen.size());
        d.Minis.assign(zeilen.size() + 1, Mini());
        for (size_t i = 0; i < zeilen.size(); ++i) {
            d.Minis[i].Name = zeilen[i].value(0);
            d.Minis[i].Vorname = zeilen[i].value(1, "V");
            d.Minis[i].Strasse = zeilen[i].value(2, "S");
            d.Minis[i].Telefon = zeilen[i].value(3, "T");
        }
    }
    void plan(std::vector<PlanEintrag> p)
    {
        d.AnzahlPlanEintraege = int16_t(p.size());
        d.Plan = std::move(p);
        d.Plan.emplace_back();
    }
    DruckErgebnis drucke(double breite = 1000, double hoehe = 2000)
    {
        dr = AufzeichnenderDrucker(breite, hoehe);
        meldungen.leeren();
        return Druckauftrag(dr, d, meldungen, uhr).fuehreAus(e);
    }
    Ort ort(const QString &text, int nummer = 1) const
    {
        const auto a = dr.gedruckt(text, nummer);
        return {a.seite, a.x, a.y};
    }
    // "title (x): text" with the critical-stop icon, "(!)" with the exclamation mark; OK boxes only.
    QStringList gezeigt() const
    {
        QStringList l;
        for (const auto &m : meldungen.gezeigt())
            l << m.titel + QStringList{": ", " (x): ", " (!): ", " (i): "}[int(m.symbol)] + m.text
                    + (m.knoepfe == Knoepfe::OK ? "" : " +Abbrechen");
        return l;
    }

    InitMini d;
    AufzeichnenderDrucker dr;
    TestMeldungen meldungen;
    TestUhr uhr;
    DruckEinstellungen e{"Times", "10", "1", true, true};
};

TEST_F(DruckauftragTest, PreparationSizeCheckAndLineStep)
{
    minis({{"A"}});
    const QStringList ganze{"8", "9", "10", "11", "12", "13", "14", "15", "16", "17", "18", "19", "20"};
    // Every whole size from 8 to 20 is set before the chosen one; a size outside them becomes 10
    // (no accepted size here is 10 itself).
    for (const auto &[groesse, abstand, punkte, schritt] :
         {std::tuple{"10.5", "1", 10.5, 21.0}, {"8", "1.5", 8.0, 24.0}, {"20", "2", 20.0, 80.0},
          {" 12 pt", "1,5", 12.0, 24.0}, {"21", "1", 10.0, 20.0}, {"7.5", "3", 10.0, 60.0}, {"", "1", 10.0, 20.0},
          {"zehn", "1", 10.0, 20.0}, {"-12", "1", 10.0, 20.0}}) {
        SCOPED_TRACE(groesse);
        e.schriftgroesse = groesse;
        e.zeilenabstand = abstand;
        ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
        EXPECT_EQ(dr.aufrufe.at(1).text + dr.aufrufe.at(16).art, "TimesdruckeZeile");   // PrinterInit after the sizes
        EXPECT_EQ(dr.texte("setzeSchriftGroesse"), ganze + QStringList{QString::number(punkte)});
        EXPECT_EQ(dr.gedruckt("A").y, 50 + 2 * schritt);   // title at T, one empty line
        // Without head servers the heading still ends the list.
        EXPECT_EQ(dr.texte("drucke").mid(1), QStringList({"A", "V", "S", "T", "Oberministranten"}));
        EXPECT_EQ(e.schriftgroesse, punkte == 10 ? QString("10") : QString(groesse));
        EXPECT_EQ(gezeigt(), punkte == 10 ? QStringList{"Falsche Schriftgröße (!): Schriftgröße nicht durchführbar! "
                                                        "Korrigiere auf 10."}
                                          : QStringList());
    }
}

TEST_F(DruckauftragTest, NothingToPrintStillEndsADocumentOfOnePage)
{
    minis({{"A"}});
    plan({E("03.01.2027", "10", {"Anna"})});
    // Neither document chosen; no servers at all; a plan chosen but without entries.
    for (const auto &[adressen, planen, anzahlMinis, eintraege] :
         {std::tuple{false, false, 1, 1}, {true, true, 0, 1}, {false, true, 1, 0}}) {
        d.AnzahlMinis = int16_t(anzahlMinis);
        d.AnzahlPlanEintraege = int16_t(eintraege);
        e.adressliste = adressen;
        e.plan = planen;
        ASSERT_EQ(drucke(), DruckErgebnis::Gedruckt);
        EXPECT_EQ(dr.texte("drucke") + dr.texte("neueSeite"), QStringList());
        EXPECT_TRUE(dr.beendet && dr.seiten == 1);
        EXPECT_EQ(gezeigt(), QStringList());
    }
}

TEST_F(DruckauftragTest, AddressListColumnsTitleAndHeadServersLast)
{
    e.plan = false;
    minis({{"Bauer", "Anna", "Hauptstr. 1", "123"}, {"Schmidt-Langname", "Bo", "Weg 2", "4567"},
           {"Ott", "Christian", "", "9"}});
    d.Minis[1].Oberministrant = true;
    drucke();
    const auto titel = dr.gedruckt("Adressverzeichnis aller Ministranten  (Stand 05.12.2026)");
    EXPECT_EQ(Ort(titel.seite, titel.x, titel.y), Ort(1, 100, 50));
    EXPECT_TRUE(titel.fett);
    // wN = 18 x 10 ("Schmidt-Langname  "), wV = 110, wS = 130; the head server last.
    const QStringList zellen{"Bauer", "Anna", "Hauptstr. 1", "123", "Ott", "Christian", "", "9",
                             "Schmidt-Langname", "Bo", "Weg 2", "4567"};
    for (int i = 0; i < 12; ++i)
        EXPECT_EQ(ort(zellen[i]), Ort(1, QList<double>{100, 280, 390, 520}[i % 4], QList<double>{90, 110, 190}[i / 4]));
    EXPECT_FALSE(dr.gedruckt("Bauer").fett);
    EXPECT_EQ(ort("Oberministranten"), Ort(1, 100, 150));   // two line steps below the last row
    EXPECT_EQ(dr.texte("neueSeite"), QStringList());
}

TEST_F(DruckauftragTest, AddressPageBreaksOfRowsAndHeadServerHeading)
{
    // Size 20, spacing 2.5: line height 40, step 100. Rows N0, N1, ... and then the head server,
    // whose long name makes the first-name column start at 100 + 21 x 20 on every page.
    e.plan = false;
    e.schriftgroesse = "20";
    e.zeilenabstand = "2.5";
    // 2400 high, T = 60: a row stays while the previous one + 200 <= 2400 - 120; the heading at
    // 2360 ends on the edge. 2380 high: a heading at 2359.5 would be within the two steps the
    // rule asks for but run past the edge. 22 rows: the row N20 no longer fits above 2T.
    for (const auto &[hoehe, zeilen, n19, n20, kopf, omi] :
         {std::tuple{2400.0, 20, Ort(1, 100, 2160), Ort(), Ort(1, 100, 2360), Ort(2, 100, 60)},
          {2380.0, 20, Ort(1, 100, 2159.5), Ort(), Ort(2, 100, 59.5), Ort(2, 100, 259.5)},
          {2400.0, 22, Ort(1, 100, 2160), Ort(2, 100, 60), Ort(2, 100, 360), Ort(2, 100, 560)}}) {
        std::vector<QStringList> z;
        for (int i = 0; i < zeilen; ++i)
            z.push_back({QStringLiteral("N%1").arg(i)});
        z.push_back({"Langer Familienname"});
        minis(z);
        d.Minis[zeilen].Oberministrant = true;
        drucke(1000, hoehe);
        EXPECT_EQ(ort("N19"), n19);
        EXPECT_EQ(ort("N20"), n20);
        EXPECT_EQ(ort("Oberministranten"), kopf);
        EXPECT_EQ(ort("Langer Familienname"), omi);
        EXPECT_EQ(std::get<1>(ort("V", 1)), 520);
        EXPECT_EQ(ort("V", zeilen + 1), Ort(std::get<0>(omi), 520, std::get<2>(omi)));
        for (size_t i = 1; i < dr.aufrufe.size(); ++i)   // PrinterInit opens every new page
            EXPECT_TRUE(dr.aufrufe[i - 1].art != "neueSeite" || dr.aufrufe[i].art == "druckeZeile") << i;
    }
}

TEST_F(DruckauftragTest, PlanTitleHeadingsAndNameColumn)
{
    e.adressliste = false;
    minis({{"A"}});
    plan({E("03.01.2027", "10:00", {"Anna", "Bo", "Cem"}), E("04.01.2027", "9.30"), E("05.01.2027", "", {""}, "")});
    drucke();
    EXPECT_EQ(ort("Ministrantenplan vom 03.01.2027 bis 05.01.2027"), Ort(1, 100, 50));
    EXPECT_TRUE(dr.gedruckt("Ministrantenplan vom 03.01.2027 bis 05.01.2027").fett);
    // Three line steps below the title; C = the widest heading measured upright, 36 characters.
    EXPECT_EQ(ort("Sonntag, den 03.01.2027, 10:00 Uhr: "), Ort(1, 100, 110));
    const auto kopf = dr.gedruckt("Sonntag, den 03.01.2027, 10:00 Uhr: ");
    EXPECT_TRUE(kopf.kursiv && !kopf.fett);
    for (int k = 0; k < 3; ++k)   // the first name on the heading's line
        EXPECT_EQ(ort(QStringList({"Anna N", "Bo N", "Cem N"})[k]), Ort(1, 460, 110 + 20 * k));
    EXPECT_FALSE(dr.gedruckt("Anna N").kursiv);
    // After an empty line; a service without servers takes one line; an unfilled place is " ".
    EXPECT_EQ(ort("Sonntag, den 04.01.2027, 9.30 Uhr: "), Ort(1, 100, 190));
    EXPECT_EQ(ort("Sonntag, den 05.01.2027,  Uhr: "), Ort(1, 100, 210));
    EXPECT_EQ(ort(" "), Ort(1, 460, 210));
    EXPECT_EQ(dr.seiten, 1);
}

TEST_F(DruckauftragTest, PlanPageBreaksWithoutRepeatingTheTitle)
{
    // 1000 x 800: T = 20, the first heading at 80, C = 320. 35 servers need 36 steps: 80 + 720
    // ends on P. 40 servers do not fit even on a fresh page; the rest goes on overleaf.
    e.adressliste = false;
    minis({{"A"}});
    for (const auto &[anzahl, a, letzter, b, c] :
         {std::tuple{35, Ort(1, 100, 80), Ort(1, 420, 760), Ort(2, 100, 20), Ort(2, 100, 40)},
          {36, Ort(2, 100, 20), Ort(2, 420, 720), Ort(2, 100, 760), Ort(3, 100, 20)},
          {40, Ort(2, 100, 20), Ort(3, 420, 20), Ort(3, 100, 60), Ort(3, 100, 80)}}) {
        QStringList namen;
        for (int k = 0; k < anzahl; ++k)
            namen << QStringLiteral("M%1").arg(k);
        plan({E("01.01.2027", "1", namen), E("02.01.2027", "2"), E("03.01.2027", "3", {"X"})});
        drucke(1000, 800);
        EXPECT_EQ(ort("Sonntag, den 01.01.2027, 1 Uhr: "), a);
        EXPECT_EQ(std::get<2>(ort("M0 N")), std::get<2>(a));
        EXPECT_EQ(ort(namen.last() + " N"), letzter);
        EXPECT_EQ(ort("Sonntag, den 02.01.2027, 2 Uhr: "), b);
        EXPECT_EQ(ort("Sonntag, den 03.01.2027, 3 Uhr: "), c);
        EXPECT_EQ(ort("Ministrantenplan vom 01.01.2027 bis 03.01.2027"), Ort(1, 100, 20));
        EXPECT_EQ(dr.texte("drucke").size(), 1 + 3 + anzahl + 1);   // the title only once
    }
}

TEST_F(DruckauftragTest, TooWideAddressColumnsOrPlanLinesAreRefused)
{
    // The widest address entries add up to 22 + 22 + 3 + 3 characters, no single row to more
    // than 31. The plan's title has 46 characters, measured upright; its heading and server line
    // 36 + 44. A = 0.8 x width. A plan after a refused list starts on the first page.
    minis({{"Aaaaaaaaaaaaaaaaaaaa", "B", "C", "D"}, {"E", "Ffffffffffffffffffff", "G", "H"}});
    for (const auto &[breite, groesse, namen, adressen, planen] :
         {std::tuple{1000.0, "10", true, true, true}, {995.0, "10", true, true, false},
          {625.0, "10", true, true, false}, {620.0, "10", true, false, false},
          {1150.0, "20", false, false, true}, {1140.0, "20", false, false, false}}) {
        SCOPED_TRACE(breite);
        e.schriftgroesse = groesse;
        plan({namen ? E("03.01.2027", "10:00", {"A"}, QString(42, 'x')) : E("03.01.2027", "")});
        ASSERT_EQ(drucke(breite), DruckErgebnis::Gedruckt);
        EXPECT_EQ(gezeigt(), (adressen ? QStringList() : QStringList{"Fehler beim Drucken (x): Adressliste" + ZuGross})
                                 + (planen ? QStringList() : QStringList{"Fehler beim Drucken (x): Plan" + ZuGross}));
        EXPECT_EQ(dr.gedruckt("E").art.isEmpty(), !adressen);
        const auto titel = ort("Ministrantenplan vom 03.01.2027 bis 03.01.2027");
        EXPECT_EQ(titel, planen ? Ort(adressen ? 2 : 1, breite / 10, 50) : Ort());
        EXPECT_EQ(dr.seiten, adressen && planen ? 2 : 1);   // the plan's own last new page adds none
        EXPECT_TRUE(dr.beendet);
    }
}

TEST_F(DruckauftragTest, ServiceFailureDiscardsTheDocumentWithOneMessage)
{
    minis({{"A"}});
    plan({E("03.01.2027", "10", {"Anna"})});
    const QString verworfen = "Fehler beim Drucken (x): Der Drucker meldet einen Fehler. Das Dokument wurde verworfen.";
    // The middle row: a service count beyond the name slots is a failure, not a crash.
    for (const auto &[scheitert, art, miniAnz, ergebnis, meldung] :
         {std::tuple{"beendeDokument", DruckerFehler::Art::Datei, 1, DruckErgebnis::DateiNichtGeschrieben,
                     QString("Als PDF speichern (x): Datei /x/PLAN.PDF konnte nicht geschrieben werden.")},
          {"", DruckerFehler::Art::Dienst, 42, DruckErgebnis::Fehlgeschlagen, verworfen},
          {"neueSeite", DruckerFehler::Art::Dienst, 1, DruckErgebnis::Fehlgeschlagen, verworfen}}) {
        SCOPED_TRACE(scheitert);
        dr = AufzeichnenderDrucker();
        dr.scheitereBei = scheitert;
        dr.fehlerArt = art;
        d.Plan[0].MiniAnz = int16_t(miniAnz);
        EXPECT_EQ(Druckauftrag(dr, d, meldungen, uhr).fuehreAus(e), ergebnis);
        EXPECT_TRUE(dr.verworfen && !dr.beendet);
        EXPECT_EQ(gezeigt(), QStringList{meldung});
        meldungen.leeren();
    }
    EXPECT_TRUE(dr.gedruckt("Anna N").art.isEmpty());   // the job stopped at the address list's new page
}

} // namespace
