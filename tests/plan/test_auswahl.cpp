// The selection rules on their own: eligibility, rotation from the random start, siblings,
// the interval.

#include "PlanHilfen.h"

#include "data/Werte.h"
#include "plan/PlanGenerator.h"
#include "support/TestZufall.h"

#include <gtest/gtest.h>

namespace {

// 07.03.2027 is a Sunday.
const QDate Sonntag = QDate(2027, 3, 7);

struct Auswahl : ::testing::Test {
    InitMini d = Gemeinde(3);
    TestZufall zufall;
    PlanGenerator gen{d, zufall};

    Auswahl()
    {
        gen.AktDatum = Sonntag;
        d.Geschwister = false;
    }
    int waehle(double start, int p = 1)
    {
        zufall.dazu(start);
        gen.WaehleMini(p);
        EXPECT_EQ(zufall.uebrig(), 0u);
        return gen.gefunden ? gen.Wahl : -1;
    }
};

TEST_F(Auswahl, FewestAssignmentsFromTheRandomStart)
{
    d.Einsaetze = {2, 1, 1, 0};
    EXPECT_EQ(waehle(0.70), 2);   // start 2: itself has the fewest
    EXPECT_EQ(waehle(0.00), 1);   // start 0: first with the fewest after it
    EXPECT_EQ(waehle(0.40), 1);   // start 1
    EXPECT_EQ(gen.Minimum, 1);
    EXPECT_EQ(gen.Zaehler, 3);    // every server examined once
}

TEST_F(Auswahl, RandomIndexIsTheWholePartOfNumberTimesCount)
{
    // 0.999.. * 3 stays below 3; 0.6667 * 3 = 2.0001 -> 2.
    EXPECT_EQ(waehle(0.9999999999), 2);
    EXPECT_EQ(waehle(0.6667), 2);
    EXPECT_EQ(waehle(0.6666), 1);
}

TEST_F(Auswahl, IneligibleServersAreSkipped)
{
    d.Einsaetze = {0, 5, 5, 0};
    d.Sperre[0] = 1;
    EXPECT_EQ(waehle(0.0), 1);
    d.Sperre[0] = 0;
    d.Minis[0].NichtEinteilen = true;
    EXPECT_EQ(waehle(0.0), 1);
    d.Minis[1].Ausgenommen[1] = true;   // Sunday
    d.Minis[2].Termine[0] = QStringLiteral("07.03.2027");
    d.Minis[2].AnzahlTermine = 1;
    EXPECT_EQ(waehle(0.0), -1);
}

TEST_F(Auswahl, NoServersMeansNoneFoundAndNoModulo)
{
    InitMini leer = Gemeinde(0);
    PlanGenerator g(leer, zufall);
    g.AktDatum = Sonntag;
    zufall.dazu(0.5);
    g.WaehleMini(1);
    EXPECT_FALSE(g.gefunden);
    EXPECT_EQ(g.Wahl, 0);
    g.ZaehleSperreHerunter();
}

TEST_F(Auswahl, BookingSetsCountersAndMemory)
{
    d.Intervall = 2;
    gen.Wahl = 1;
    gen.BucheEinsatz();
    EXPECT_EQ(d.Einsaetze[1], 1);
    EXPECT_EQ(d.Sperre[1], 3);
    EXPECT_EQ(gen.MemName, QStringLiteral("Name 1"));
    EXPECT_EQ(gen.MemStrasse, QStringLiteral("Weg 1"));
    gen.ZaehleSperreHerunter();
    gen.ZaehleSperreHerunter();
    EXPECT_EQ(d.Sperre[1], 1);
    EXPECT_FALSE(gen.Bedingungen(1));
    gen.ZaehleSperreHerunter();
    gen.ZaehleSperreHerunter();
    EXPECT_EQ(d.Sperre[1], 0);
    EXPECT_TRUE(gen.Bedingungen(1));
}

TEST_F(Auswahl, SixteenBitLimitsOfTheCounters)
{
    d.Einsaetze[0] = 32767;
    gen.Wahl = 0;
    EXPECT_THROW(gen.BucheEinsatz(), Laufzeitfehler);
    d.Einsaetze[0] = 0;
    d.Intervall = 32767;   // Sperre = Intervall + 1 does not fit
    EXPECT_THROW(gen.BucheEinsatz(), Laufzeitfehler);
}

TEST_F(Auswahl, NegativeIntervalStillBlocksTheRestOfTheService)
{
    d.Intervall = -3;
    gen.Wahl = 2;
    gen.BucheEinsatz();
    EXPECT_EQ(d.Sperre[2], 1);
    EXPECT_FALSE(gen.Bedingungen(2));
}

TEST_F(Auswahl, IndexOutsideTheRosterOrItsCountersFails)
{
    EXPECT_THROW(gen.Bedingungen(3), Laufzeitfehler);
    EXPECT_THROW(gen.Bedingungen(-1), Laufzeitfehler);
    d.Sperre.resize(1);
    EXPECT_THROW(gen.Bedingungen(2), Laufzeitfehler);
    EXPECT_THROW(gen.ZaehleSperreHerunter(), Laufzeitfehler);
}

// Excluded weekdays and dates.
struct Bedingungen : Auswahl {
    void termine(std::initializer_list<const char *> texte, int anzahl = -1)
    {
        int k = 0;
        for (const char *t : texte)
            d.Minis[0].Termine[std::size_t(k++)] = QString::fromUtf8(t);
        d.Minis[0].AnzahlTermine = int16_t(anzahl < 0 ? k : anzahl);
    }
    bool an(const QDate &tag)
    {
        gen.AktDatum = tag;
        return gen.Bedingungen(0);
    }
};

TEST_F(Bedingungen, FirstWeekdayFlagIsSunday)
{
    d.Minis[0].Ausgenommen[1] = true;
    EXPECT_FALSE(an(Sonntag));
    EXPECT_TRUE(an(Sonntag.addDays(1)));
    EXPECT_TRUE(an(Sonntag.addDays(-1)));
    d.Minis[0].Ausgenommen[1] = false;
    d.Minis[0].Ausgenommen[7] = true;
    EXPECT_TRUE(an(Sonntag));
    EXPECT_FALSE(an(Sonntag.addDays(-1)));
}

TEST_F(Bedingungen, RangeIncludesBothEnds)
{
    termine({"01.03.2027-03.03.2027"});
    EXPECT_TRUE(an(QDate(2027, 2, 28)));
    EXPECT_FALSE(an(QDate(2027, 3, 1)));
    EXPECT_FALSE(an(QDate(2027, 3, 2)));
    EXPECT_FALSE(an(QDate(2027, 3, 3)));
    EXPECT_TRUE(an(QDate(2027, 3, 4)));
}

TEST_F(Bedingungen, SingleDatesShortFormsReversedRangesAndEmptyEntries)
{
    termine({"", "5.3.27", "10.03.2027-08.03.2027", " 12.03.2027 "});
    EXPECT_FALSE(an(QDate(2027, 3, 5)));
    EXPECT_TRUE(an(QDate(2027, 3, 9)));   // a reversed range excludes nothing
    EXPECT_FALSE(an(QDate(2027, 3, 12)));
    EXPECT_TRUE(an(QDate(2027, 3, 6)));
}

TEST_F(Bedingungen, OnlyCountedEntriesAreRead)
{
    termine({"07.03.2027", "kaputt"}, 0);
    EXPECT_TRUE(an(Sonntag));
    d.Minis[0].AnzahlTermine = -4;
    EXPECT_TRUE(an(Sonntag));
    d.Minis[0].AnzahlTermine = 1;
    EXPECT_FALSE(an(Sonntag));
}

TEST_F(Bedingungen, UnreadableEntryFailsOnlyWhenReached)
{
    termine({"05.03.2027", "kaputt", "07.03.2027"});
    EXPECT_FALSE(an(QDate(2027, 3, 5)));       // an earlier entry decides first
    EXPECT_THROW(an(Sonntag), Laufzeitfehler); // the later matching entry is never reached
    d.Minis[0].Ausgenommen[1] = true;
    EXPECT_FALSE(an(Sonntag));                 // the weekday is checked before the entries
    d.Minis[0].Ausgenommen[1] = false;
    d.Minis[0].NichtEinteilen = true;
    EXPECT_THROW(an(Sonntag), Laufzeitfehler); // "nicht einteilen" comes after the entries
    d.Sperre[0] = 2;
    EXPECT_THROW(an(Sonntag), Laufzeitfehler); // so does the interval
}

TEST_F(Bedingungen, EveryMalformedRangeFails)
{
    for (const char *text : {"-07.03.2027", "07.03.2027-", "07.03.2027-31.02.2027", "07.03.2027 - 08.03.2027x",
                             "07.03.2027-08.03.2027-09.03.2027", "2027-03-07"}) {
        termine({text});
        EXPECT_THROW(an(Sonntag), Laufzeitfehler) << text;
    }
    termine({"07.03.2027 - 08.03.2027"});   // blanks around each side are allowed
    EXPECT_FALSE(an(QDate(2027, 3, 8)));
}

TEST_F(Bedingungen, MoreThan31EntriesFailWhenTheSearchGetsThere)
{
    termine({"07.03.2027"}, 31);
    for (int k = 1; k < MaxTermine; ++k)
        d.Minis[0].Termine[std::size_t(k)] = QStringLiteral("01.01.2020");
    EXPECT_FALSE(an(Sonntag));
    EXPECT_TRUE(an(Sonntag.addDays(1)));
    d.Minis[0].AnzahlTermine = 32;
    EXPECT_FALSE(an(Sonntag));                 // decided by entry 0
    EXPECT_THROW(an(Sonntag.addDays(1)), Laufzeitfehler);
}

// Siblings: servers 1 and 2 share family name and street.
struct Geschwister : Auswahl {
    Geschwister()
    {
        d = Gemeinde(4);
        d.Minis[2].Name = d.Minis[1].Name;
        d.Minis[2].Strasse = d.Minis[1].Strasse;
        d.Geschwister = true;
    }
    // Position 1 to server 1 (random start 1 of 4), then position 2.
    int zweitePosition(double geschwisterZufall, std::initializer_list<double> weitere = {})
    {
        EXPECT_EQ(waehle(0.30), 1);
        gen.BucheEinsatz();
        zufall.dazu(geschwisterZufall);
        for (double w : weitere)
            zufall.dazu(w);
        gen.WaehleMini(2);
        EXPECT_EQ(zufall.uebrig(), 0u);
        return gen.gefunden ? gen.Wahl : -1;
    }
};

TEST_F(Geschwister, SecondPositionGoesToTheSibling)
{
    EXPECT_EQ(zweitePosition(0.9), 2);
}

TEST_F(Geschwister, SiblingGivesWayToFewerAssignments)
{
    d.Einsaetze[2] = 1;
    EXPECT_EQ(zweitePosition(0.0), 3);   // ring from 2: server 3 has 0 < 1
}

TEST_F(Geschwister, IneligibleSiblingFallsBackToTheRandomStart)
{
    d.Minis[2].NichtEinteilen = true;
    EXPECT_EQ(zweitePosition(0.0, {0.0}), 0);
}

TEST_F(Geschwister, RuleOffChoosesLikeAnyOther)
{
    d.Geschwister = false;
    EXPECT_EQ(zweitePosition(0.0), 0);
}

TEST_F(Geschwister, NameAndStreetMustMatchExactly)
{
    d.Minis[2].Strasse = d.Minis[1].Strasse.toUpper();
    EXPECT_EQ(zweitePosition(0.0, {}), 0);   // no candidate: the one number is the random start
}

TEST_F(Geschwister, ElevenCandidatesFitATwelfthFails)
{
    d = Gemeinde(13);
    d.Geschwister = true;
    for (auto &m : d.Minis) {
        m.Name = QStringLiteral("Huber");
        m.Strasse = QStringLiteral("Dorfstraße 1");
    }
    d.Minis[12].Name = QStringLiteral("Meier");
    gen.Wahl = 0;
    gen.MemName = QStringLiteral("Huber");
    gen.MemStrasse = QStringLiteral("Dorfstraße 1");
    zufall.dazu(0.5);   // r = 5 of 11 candidates (1..11): server 6
    gen.WaehleMini(2);
    EXPECT_EQ(gen.Wahl, 6);

    d.Minis[12].Name = QStringLiteral("Huber");
    gen.Wahl = 0;
    EXPECT_THROW(gen.WaehleMini(2), Laufzeitfehler);
    EXPECT_EQ(zufall.uebrig(), 0u);
}

TEST_F(Geschwister, CandidateRingWrapsAround)
{
    d = Gemeinde(5);
    d.Geschwister = true;
    for (int i : {0, 2, 4}) {
        d.Minis[std::size_t(i)].Name = QStringLiteral("Huber");
        d.Minis[std::size_t(i)].Strasse = QStringLiteral("Dorfstraße 1");
    }
    d.Sperre[4] = 1;
    gen.Wahl = 2;   // candidates 0 and 4; start at 4 (blocked), wrap to 0
    gen.MemName = QStringLiteral("Huber");
    gen.MemStrasse = QStringLiteral("Dorfstraße 1");
    zufall.dazu(0.6);
    gen.WaehleMini(2);
    EXPECT_EQ(gen.Wahl, 0);
}

} // namespace
