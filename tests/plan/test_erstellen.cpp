// The computation behind "Erstellen": period checks, the day's services, failures and progress.

#include "PlanHilfen.h"

#include "plan/PlanGenerator.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"
#include "support/TestZufall.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

const QString FehlerText = QStringLiteral(
    "Fehler unbekannten Typs, möglicherweise durch Fehler bei der Eingabe. Bitte kontrollieren Sie Ihre Eingaben.");

struct Erstellen : ::testing::Test {
    InitMini d = Gemeinde(0);
    TestZufall zufall;
    TestMeldungen meldungen;
    TestUhr uhr;
    PlanGenerator gen{d, zufall};
    std::vector<int> fortschritt;

    // Enough random numbers for small plans; most tests do not care which server is chosen.
    void zufallVorrat(int n = 500)
    {
        for (int i = 0; i < n; ++i)
            zufall.dazu(0.0);
    }
    PlanGenerator::Ergebnis erstelle(const QString &start, const QString &ende)
    {
        return gen.BtnErstellen_Click(start, ende, meldungen, uhr, [this](int p) { fortschritt.push_back(p); });
    }
    // An old plan that refused or failed computations must keep.
    void alterPlan()
    {
        d.Plan.resize(1);
        d.Plan[0].Datum = QStringLiteral("01.01.2000");
        d.Plan[0].MiniAnz = 1;
        d.Plan[0].Name[0] = QStringLiteral("Alt");
        d.AnzahlPlanEintraege = 1;
    }
    void erwarteAlterPlan()
    {
        ASSERT_EQ(d.AnzahlPlanEintraege, 1);
        EXPECT_EQ(d.Plan[0].Name[0], QStringLiteral("Alt"));
        EXPECT_FALSE(d.Geaendert);
        EXPECT_EQ(zufall.starts(), 0);
    }
    QStringList tage() const
    {
        QStringList l;
        for (int i = 0; i < d.AnzahlPlanEintraege; ++i)
            l << d.Plan[std::size_t(i)].Datum + u' ' + d.Plan[std::size_t(i)].Zeit;
        return l;
    }
};

TEST_F(Erstellen, OneDayAsksNothingAndShowsNoProgress)
{
    d = Gemeinde(2);
    SetzeRegulaer(d, 1, {"1"});
    zufallVorrat(1);
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("7.3.27")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_TRUE(meldungen.gezeigt().empty());
    EXPECT_TRUE(fortschritt.empty());
    EXPECT_TRUE(d.Geaendert);
    ASSERT_EQ(d.AnzahlPlanEintraege, 1);
    EXPECT_EQ(d.Plan[0].Datum, QStringLiteral("07.03.2027"));
    EXPECT_EQ(d.Plan[0].Wochentag, QStringLiteral("Sonntag"));
    EXPECT_EQ(d.Plan[0].Zeit, QStringLiteral("Zeit 1"));
    EXPECT_EQ(d.Plan[0].MiniAnz, 1);
    EXPECT_EQ(d.Plan[0].Name[0], QStringLiteral("Name 0"));
    EXPECT_EQ(d.Plan[0].Vorname[0], QStringLiteral("Vorname 0"));
}

TEST_F(Erstellen, SeedsOnceFromTheTimeOfDay)
{
    uhr.setze(QDateTime(QDate(2026, 12, 5), QTime(9, 30, 0, 250)));
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("02.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(zufall.starts(), 1);
    EXPECT_EQ(zufall.letzterStartwert(), 34200250u);
}

TEST_F(Erstellen, HundredDaysAskNothing)
{
    EXPECT_EQ(erstelle(QStringLiteral("01.01.2027"), QStringLiteral("11.04.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_TRUE(meldungen.gezeigt().empty());
}

TEST_F(Erstellen, LongerPeriodAsksWithTwoBlanksBeforeTheNumber)
{
    alterPlan();
    meldungen.antworte(Antwort::Nein);
    EXPECT_EQ(erstelle(QStringLiteral("01.01.2027"), QStringLiteral("12.04.2027")), PlanGenerator::Ergebnis::Abgelehnt);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    const auto &frage = meldungen.gezeigt()[0];
    EXPECT_EQ(frage.text, QStringLiteral("Sie wollen einen Plan der Dauer  101 Tage berechnen. Ist dies korrekt?"));
    EXPECT_EQ(frage.titel, QStringLiteral("Planberechnung"));
    EXPECT_EQ(frage.knoepfe, Knoepfe::JaNein);
    EXPECT_EQ(frage.symbol, Symbol::Keins);
    erwarteAlterPlan();

    meldungen.leeren();
    meldungen.antworte(Antwort::Ja);
    EXPECT_EQ(erstelle(QStringLiteral("01.01.2027"), QStringLiteral("12.04.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(d.AnzahlPlanEintraege, 0);
    EXPECT_TRUE(d.Geaendert);
}

TEST_F(Erstellen, AYearIsComputedMoreIsRefusedAfterTheQuestion)
{
    EXPECT_EQ(erstelle(QStringLiteral("01.01.2028"), QStringLiteral("31.12.2028")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(meldungen.texte(),
              QStringList{QStringLiteral("Sie wollen einen Plan der Dauer  365 Tage berechnen. Ist dies korrekt?")});
    EXPECT_EQ(fortschritt.size(), 365u);

    alterPlan();
    d.Geaendert = false;
    meldungen.leeren();
    zufall = TestZufall();
    EXPECT_EQ(erstelle(QStringLiteral("01.01.2027"), QStringLiteral("02.01.2028")), PlanGenerator::Ergebnis::Abgelehnt);
    ASSERT_EQ(meldungen.gezeigt().size(), 2u);
    EXPECT_EQ(meldungen.gezeigt()[0].text,
              QStringLiteral("Sie wollen einen Plan der Dauer  366 Tage berechnen. Ist dies korrekt?"));
    const auto &box = meldungen.gezeigt()[1];
    EXPECT_EQ(box.text, QStringLiteral("Planberechnung über ein Jahr macht keinen Sinn! \r\r\nBitte wählen Sie die "
                                       "Zeitspanne kleiner!"));
    EXPECT_EQ(box.titel, QStringLiteral("Zeitspanne zu groß"));
    EXPECT_EQ(box.knoepfe, Knoepfe::OK);
    EXPECT_EQ(box.symbol, Symbol::Kritisch);
    erwarteAlterPlan();
}

TEST_F(Erstellen, EndBeforeStartIsRefused)
{
    alterPlan();
    EXPECT_EQ(erstelle(QStringLiteral("02.03.2027"), QStringLiteral("01.03.2027")), PlanGenerator::Ergebnis::Abgelehnt);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    const auto &box = meldungen.gezeigt()[0];
    EXPECT_EQ(box.text, QStringLiteral("Datum wurde falsch angegeben!"));
    EXPECT_EQ(box.titel, QStringLiteral("Fehler im Datum"));
    EXPECT_EQ(box.knoepfe, Knoepfe::OK);
    EXPECT_EQ(box.symbol, Symbol::Kritisch);
    erwarteAlterPlan();
}

TEST_F(Erstellen, TextsThatAreNoDatesOrLengthsBeyond16BitsAreCalculationErrors)
{
    const std::pair<const char *, const char *> faelle[] = {
        {"01.03.2027", ""}, {"morgen", "01.03.2027"}, {"31.02.2027", "01.03.2027"},
        {"01.01.1900", "01.01.2000"}, {"01.01.2000", "01.01.1900"}};
    for (const auto &[start, ende] : faelle) {
        alterPlan();
        meldungen.leeren();
        EXPECT_EQ(erstelle(QString::fromLatin1(start), QString::fromLatin1(ende)), PlanGenerator::Ergebnis::Fehler);
        ASSERT_EQ(meldungen.gezeigt().size(), 1u);
        const auto &box = meldungen.gezeigt()[0];
        EXPECT_EQ(box.text, FehlerText);
        EXPECT_EQ(box.titel, QStringLiteral("Fehler bei der Planberechnung"));
        EXPECT_EQ(box.knoepfe, Knoepfe::OK);
        EXPECT_EQ(box.symbol, Symbol::Kritisch);
        erwarteAlterPlan();
    }
}

TEST_F(Erstellen, ProgressIsTheWholePercentAfterEveryDayButTheLast)
{
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("04.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(fortschritt, (std::vector<int>{33, 66, 100}));
    fortschritt.clear();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("08.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(fortschritt, (std::vector<int>{14, 28, 42, 57, 71, 85, 100}));
}

TEST_F(Erstellen, EntriesInDayThenSlotOrderAndEmptySlotsSkipped)
{
    d = Gemeinde(10);
    SetzeJedenTag(d, {"1", "", "2"});
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("03.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(tage(), (QStringList{"01.03.2027 Zeit 1", "01.03.2027 Zeit 3", "02.03.2027 Zeit 1",
                                   "02.03.2027 Zeit 3", "03.03.2027 Zeit 1", "03.03.2027 Zeit 3"}));
    EXPECT_EQ(d.Plan[1].Wochentag, QStringLiteral("Montag"));
    EXPECT_EQ(d.Plan[5].Wochentag, QStringLiteral("Mittwoch"));
}

TEST_F(Erstellen, CountTextsReadTheLeadingNumberRoundedHalfToEven)
{
    d = Gemeinde(10);
    d.Intervall = 0;
    SetzeRegulaer(d, 1, {"2,5", "2.5", "3.5", " 3 Minis"});
    SetzeRegulaer(d, 2, {"", "0", "-1", "x"});
    SetzeRegulaer(d, 3, {"0.4", "0.5", "0.6", "&H2"});
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("09.03.2027")), PlanGenerator::Ergebnis::Fertig);
    std::vector<int> anzahlen;
    for (int i = 0; i < d.AnzahlPlanEintraege; ++i)
        anzahlen.push_back(d.Plan[std::size_t(i)].MiniAnz);
    EXPECT_EQ(anzahlen, (std::vector<int>{2, 2, 4, 3, 1, 2}));
    EXPECT_EQ(d.Plan[4].Zeit, QStringLiteral("Zeit 3"));
    EXPECT_EQ(d.TagesZeit[4], QStringLiteral("Zeit 4"));
    EXPECT_EQ(d.TagesMiniAnz[4], 2);
}

TEST_F(Erstellen, ExceptionPageReplacesTheWholeDay)
{
    d = Gemeinde(5);
    SetzeJedenTag(d, {"1", "1"});
    d.Ausnahmen = {Seite(QString(), {"3"}), Seite(QStringLiteral("02.03.2027"), {"", "", "", "2"}),
                   Seite(QStringLiteral("02.03.2027"), {"1"}), Seite(QStringLiteral("03.03.2027"), {"0", "0"})};
    d.AnzahlAusnahmen = 4;
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("04.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(tage(), (QStringList{"01.03.2027 Zeit 1", "01.03.2027 Zeit 2", "02.03.2027 Fest 4",
                                   "04.03.2027 Zeit 1", "04.03.2027 Zeit 2"}));
    EXPECT_EQ(d.Plan[2].MiniAnz, 2);
    EXPECT_FALSE(gen.TerminGefunden);
}

TEST_F(Erstellen, PagesBeyondTheCountAreNotRead)
{
    d = Gemeinde(5);
    d.Ausnahmen = {Seite(QStringLiteral("01.03.2027"), {"1"}), Seite(QStringLiteral("kaputt"), {"1"})};
    d.AnzahlAusnahmen = 1;
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("02.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(tage(), QStringList{"01.03.2027 Fest 1"});
}

TEST_F(Erstellen, UnreadablePageFailsOnTheFirstDayItsSearchReaches)
{
    d = Gemeinde(5);
    SetzeJedenTag(d, {"1"});
    d.Ausnahmen = {Seite(QStringLiteral("01.03.2027"), {"2"}), Seite(QStringLiteral("1.3."), {"1"}),
                   Seite(QStringLiteral("02.03.2027"), {"1"})};
    d.AnzahlAusnahmen = 3;
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("05.03.2027")), PlanGenerator::Ergebnis::Fehler);
    EXPECT_EQ(meldungen.texte(), QStringList{FehlerText});
    EXPECT_EQ(tage(), QStringList{"01.03.2027 Fest 1"});
    EXPECT_EQ(fortschritt, std::vector<int>{25});
    EXPECT_FALSE(d.Geaendert);
}

TEST_F(Erstellen, FailureKeepsTheEntriesSoFarAndTheCounters)
{
    d = Gemeinde(3);
    d.Intervall = 0;
    SetzeJedenTag(d, {"2"});
    d.Minis[2].Termine[0] = QStringLiteral("01.03.2027-01.03.2027");
    d.Minis[2].Termine[1] = QStringLiteral("02.03.2027-");
    d.Minis[2].AnzahlTermine = 2;
    alterPlan();
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("03.03.2027")), PlanGenerator::Ergebnis::Fehler);
    EXPECT_EQ(meldungen.titel(), QStringList{QStringLiteral("Fehler bei der Planberechnung")});
    // Day 1 complete; the entry of day 2 was added before its first choice failed.
    ASSERT_EQ(d.AnzahlPlanEintraege, 2);
    EXPECT_EQ(d.Plan[0].Name[0], QStringLiteral("Name 0"));
    EXPECT_EQ(d.Plan[0].Name[1], QStringLiteral("Name 1"));
    EXPECT_EQ(d.Plan[1].Datum, QStringLiteral("02.03.2027"));
    EXPECT_EQ(d.Plan[1].MiniAnz, 2);
    EXPECT_TRUE(d.Plan[1].Name[0].isEmpty());
    EXPECT_EQ(d.Einsaetze, (std::vector<int16_t>{1, 1, 0, 0}));
    EXPECT_FALSE(d.Geaendert);
}

TEST_F(Erstellen, FortyOneServersFitAFortySecondFails)
{
    d = Gemeinde(50);
    SetzeRegulaer(d, 1, {"41"});
    SetzeRegulaer(d, 2, {"1", "42"});
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("08.03.2027")), PlanGenerator::Ergebnis::Fehler);
    // The entry that cannot hold its servers is not added, so the plan stays writable.
    ASSERT_EQ(d.AnzahlPlanEintraege, 2);
    ASSERT_EQ(d.Plan.size(), 2u);
    EXPECT_EQ(d.Plan[0].MiniAnz, 41);
    EXPECT_FALSE(d.Plan[0].Name[40].isEmpty());
    EXPECT_EQ(d.Plan[1].MiniAnz, 1);
}

TEST_F(Erstellen, CountOutside16BitsFailsBeforeTheDayGetsAnEntry)
{
    d = Gemeinde(2);
    SetzeRegulaer(d, 1, {"1", "", "", "40000"});
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("07.03.2027")), PlanGenerator::Ergebnis::Fehler);
    EXPECT_EQ(d.AnzahlPlanEintraege, 0);
}

TEST_F(Erstellen, WithoutServersEveryPositionStaysEmpty)
{
    SetzeJedenTag(d, {"3"});
    zufallVorrat(2);   // one random start per service; the other positions are not attempted
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("02.03.2027")), PlanGenerator::Ergebnis::Fertig);
    ASSERT_EQ(d.AnzahlPlanEintraege, 2);
    EXPECT_EQ(d.Plan[1].MiniAnz, 3);
    for (int k = 0; k < 3; ++k)
        EXPECT_TRUE(d.Plan[1].Name[std::size_t(k)].isEmpty() && d.Plan[1].Vorname[std::size_t(k)].isEmpty());
    EXPECT_EQ(zufall.uebrig(), 0u);
}

TEST_F(Erstellen, IntervalZeroSingleServerTakesEveryFirstPositionOnly)
{
    d = Gemeinde(1);
    d.Intervall = 0;
    SetzeRegulaer(d, 1, {"2", "2"});
    zufallVorrat(4);
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("07.03.2027")), PlanGenerator::Ergebnis::Fertig);
    ASSERT_EQ(d.AnzahlPlanEintraege, 2);
    for (int e = 0; e < 2; ++e) {
        EXPECT_EQ(d.Plan[std::size_t(e)].Name[0], QStringLiteral("Name 0"));
        EXPECT_TRUE(d.Plan[std::size_t(e)].Name[1].isEmpty());
        EXPECT_EQ(d.Plan[std::size_t(e)].MiniAnz, 2);
    }
    EXPECT_EQ(d.Einsaetze[0], 2);
    EXPECT_EQ(zufall.uebrig(), 0u);
}

TEST_F(Erstellen, FourPositionsTwoEligibleLeaveTheLastTwoEmpty)
{
    d = Gemeinde(4);
    d.Minis[1].NichtEinteilen = true;
    d.Minis[3].Ausgenommen[1] = true;
    SetzeRegulaer(d, 1, {"4"});
    zufallVorrat(3);   // positions 1, 2 and the failing 3; position 4 is not attempted
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("07.03.2027")), PlanGenerator::Ergebnis::Fertig);
    ASSERT_EQ(d.AnzahlPlanEintraege, 1);
    const PlanEintrag &e = d.Plan[0];
    EXPECT_EQ(e.MiniAnz, 4);
    EXPECT_EQ(e.Name[0], QStringLiteral("Name 0"));
    EXPECT_EQ(e.Name[1], QStringLiteral("Name 2"));
    EXPECT_TRUE(e.Name[2].isEmpty());
    EXPECT_TRUE(e.Name[3].isEmpty());
    EXPECT_EQ(zufall.uebrig(), 0u);
}

TEST_F(Erstellen, IntervalCountsServicesAcrossDaysAndCountersCarryOver)
{
    d = Gemeinde(3);
    d.Intervall = 2;
    SetzeJedenTag(d, {"1"});
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("06.03.2027")), PlanGenerator::Ergebnis::Fertig);
    QStringList namen;
    for (int i = 0; i < d.AnzahlPlanEintraege; ++i)
        namen << d.Plan[std::size_t(i)].Name[0];
    EXPECT_EQ(namen, (QStringList{"Name 0", "Name 1", "Name 2", "Name 0", "Name 1", "Name 2"}));

    // The next computation continues from the counters: servers 1 and 2 are still blocked.
    zufallVorrat();
    EXPECT_EQ(erstelle(QStringLiteral("07.03.2027"), QStringLiteral("07.03.2027")), PlanGenerator::Ergebnis::Fertig);
    EXPECT_EQ(d.Plan[0].Name[0], QStringLiteral("Name 0"));
    EXPECT_EQ(d.Einsaetze, (std::vector<int16_t>{3, 2, 2, 0}));
}

} // namespace

namespace {

TEST_F(Erstellen, ANewPlanKeepsNothingOfTheOldOne)
{
    d = Gemeinde(6);
    SetzeJedenTag(d, {"4", "2"});
    zufallVorrat();
    ASSERT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("03.03.2027")), PlanGenerator::Ergebnis::Fertig);
    ASSERT_EQ(d.Plan.size(), 6u);

    // Fewer servers and a shorter period: places that held names before must come out empty.
    for (int i = 2; i < 6; ++i)
        d.Minis[std::size_t(i)].NichtEinteilen = true;
    SetzeJedenTag(d, {"1", "4"});
    zufallVorrat();
    ASSERT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("02.03.2027")), PlanGenerator::Ergebnis::Fertig);
    ASSERT_EQ(d.AnzahlPlanEintraege, 4);
    EXPECT_EQ(d.Plan.size(), 4u);
    for (int e = 0; e < 4; ++e) {
        const PlanEintrag &p = d.Plan[std::size_t(e)];
        int besetzt = 0;
        for (int k = 0; k < MaxPlaetze; ++k)
            besetzt += !p.Name[std::size_t(k)].isEmpty() + !p.Vorname[std::size_t(k)].isEmpty();
        EXPECT_LE(besetzt, 2 * 2) << e;
        EXPECT_TRUE(p.Name[2].isEmpty() && p.Name[3].isEmpty()) << e;
    }

    // A failing computation leaves exactly the entries it made.
    d.Minis[0].Termine[0] = QStringLiteral("kaputt");
    d.Minis[0].AnzahlTermine = 1;
    zufallVorrat();
    ASSERT_EQ(erstelle(QStringLiteral("01.03.2027"), QStringLiteral("02.03.2027")), PlanGenerator::Ergebnis::Fehler);
    EXPECT_EQ(d.AnzahlPlanEintraege, 1);
    EXPECT_EQ(d.Plan.size(), 1u);
}

} // namespace
