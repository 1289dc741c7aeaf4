// The selection rules and "Erstellen" with exact random numbers; random rosters against the plain rules.

#include "data/Datum.h"
#include "data/InitMini.h"
#include "data/Werte.h"
#include "plan/PlanGenerator.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"
#include "support/TestZufall.h"

#include <QRegularExpression>

#include <gtest/gtest.h>

#include <algorithm>
#include <climits>
#include <random>

void PrintTo(const QString &text, std::ostream *os) { *os << '"' << text.toStdString() << '"'; }   // readable

namespace {

using Ergebnis = PlanGenerator::Ergebnis;
const QRegularExpression Rest(QStringLiteral(",+$"));

// Boxes as "title: text [buttons icon]": OK = 0, JaNein = 3; no icon = 0, critical = 1.
const QString FehlerBox = QStringLiteral("Fehler bei der Planberechnung: Fehler unbekannten Typs, möglicherweise "
                                         "durch Fehler bei der Eingabe. Bitte kontrollieren Sie Ihre Eingaben. [0 1]");

InitMini Gemeinde(int n)   // "Vi Ni" in streets "Wi", with the spare top element
{
    InitMini d;
    d.Minis.resize(std::size_t(n) + 1);
    for (int i = 0; i < n; ++i) {
        d.Minis[i].Name = QStringLiteral("N%1").arg(i);
        d.Minis[i].Vorname = QStringLiteral("V%1").arg(i);
        d.Minis[i].Strasse = QStringLiteral("W%1").arg(i);
    }
    d.AnzahlMinis = int16_t(n);
    d.Sperre = d.Einsaetze = std::vector<int16_t>(std::size_t(n) + 1, 0);
    return d;
}

// Slots "Zeit 1".. of weekday tag (1 = Sonntag, 0 = every day) with these count texts.
void Dienste(InitMini &d, int tag, const std::vector<const char *> &anzahlen)
{
    for (std::size_t k = 0; k < anzahlen.size(); ++k) {
        for (int t = tag ? tag : 1; t <= (tag ? tag : 7); ++t) {
            d.Regulaer[t].Zeit[k] = QStringLiteral("Zeit %1").arg(k + 1);
            d.Regulaer[t].MiniAnz[k] = QString::fromUtf8(anzahlen[k]);
        }
    }
}

AusnahmeSeite Seite(const char *datum, const std::vector<const char *> &anzahlen)
{
    InitMini d;
    Dienste(d, 1, anzahlen);
    return {QString::fromUtf8(datum), d.Regulaer[1].Zeit, d.Regulaer[1].MiniAnz};
}

template<typename F>
int Pruefe(F pruefung)   // 1 eligible, 0 not, -1 the check fails
{
    try {
        return pruefung() ? 1 : 0;
    } catch (const Laufzeitfehler &) {
        return -1;
    }
}

struct Plan : ::testing::Test {
    InitMini d = Gemeinde(3);
    TestZufall zufall;
    TestMeldungen meldungen;
    TestUhr uhr{QDateTime(QDate(2026, 12, 5), QTime(9, 30, 0, 250))};
    PlanGenerator gen{d, zufall};
    std::vector<int> fortschritt;

    Plan() { gen.AktDatum = QDate(2027, 3, 7); }   // a Sunday
    int waehle(std::vector<double> zahlen, int p = 1)   // exactly these random numbers; -1: nobody
    {
        for (double z : zahlen)
            zufall.dazu(z);
        gen.WaehleMini(p);
        EXPECT_EQ(zufall.uebrig(), 0u);
        return gen.gefunden ? gen.Wahl : -1;
    }
    Ergebnis erstelle(const char *start, const char *ende, int zahlen = 500)   // rotations start at server 0
    {
        for (int i = 0; i < zahlen; ++i)
            zufall.dazu(0.0);
        return gen.BtnErstellen_Click(QString::fromUtf8(start), QString::fromUtf8(ende), meldungen, uhr,
                                      [this](int p) { fortschritt.push_back(p); });
    }
    QStringList boxen() const
    {
        QStringList l;
        for (const auto &b : meldungen.gezeigt())
            l << QStringLiteral("%1: %2 [%3 %4]").arg(b.titel, b.text).arg(int(b.knoepfe)).arg(int(b.symbol));
        return l;
    }
    QStringList plan() const   // "date time xcount: servers" per entry, a name left anywhere shows
    {
        QStringList l;
        for (int e = 0; e < d.AnzahlPlanEintraege; ++e) {
            const PlanEintrag &p = d.Plan[std::size_t(e)];
            QStringList namen;
            for (int k = 0; k < MaxPlaetze; ++k)
                namen << (p.Vorname[k] + u' ' + p.Name[k]).trimmed();
            l << QStringLiteral("%1 %2 x%3: %4").arg(p.Datum, p.Zeit).arg(p.MiniAnz).arg(namen.join(u',').remove(Rest));
        }
        return l;
    }
};

TEST_F(Plan, ExcludedWeekdaysAndDatesFailOnlyWhenReached)
{
    const int Alle = 99;   // days of March 2027 (7 = Sunday): 1 eligible, 0 excluded, -1 fails
    const struct { int wochentag; std::vector<const char *> termine; std::vector<std::pair<int, int>> tage;
                   int anzahl = Alle; } faelle[] = {
        {1, {}, {{7, 0}, {8, 1}, {6, 1}}}, {7, {}, {{7, 1}, {6, 0}}},
        {0, {"01.03.2027-03.03.2027"}, {{0, 1}, {1, 0}, {2, 0}, {3, 0}, {4, 1}}},
        {0, {"", "5.3.27", "10.03.2027-08.03.2027", " 12.03.2027 "}, {{5, 0}, {6, 1}, {9, 1}, {12, 0}}},
        {0, {"07.03.2027 - 08.03.2027"}, {{8, 0}, {9, 1}}},
        {0, {"07.03.2027", "kaputt"}, {{7, 1}}, 0}, {0, {"07.03.2027", "kaputt"}, {{7, 1}}, -4},
        {0, {"07.03.2027", "kaputt"}, {{7, 0}}, 1}, {0, {"05.03.2027", "kaputt", "07.03.2027"}, {{5, 0}, {7, -1}}},
        {1, {"kaputt"}, {{7, 0}, {8, -1}}},   // the weekday is checked first
        {0, {"08.03.2027"}, {{8, 0}, {7, -1}}, 32}, {0, {"08.03.2027"}, {{7, 1}}, 31},   // at most 31 are read
        {0, {"-07.03.2027"}, {{7, -1}}}, {0, {"07.03.2027-"}, {{7, -1}}}, {0, {"09.03.2027-31.02.2027"}, {{7, -1}}},
        {0, {"07.03.2027-08.03.2027-09.03.2027"}, {{7, -1}}}, {0, {"07.03.2027 - 08.03.2027x"}, {{7, -1}}}};
    Mini &m = d.Minis[0];
    for (const auto &f : faelle) {
        m = Mini();
        m.Ausgenommen[f.wochentag] = f.wochentag > 0;
        for (std::size_t k = 0; k < f.termine.size(); ++k)
            m.Termine[k] = QString::fromUtf8(f.termine[k]);
        m.AnzahlTermine = int16_t(f.anzahl == Alle ? int(f.termine.size()) : f.anzahl);
        for (const auto &[tag, erwartet] : f.tage) {
            gen.AktDatum = QDate(2027, 3, 1).addDays(tag - 1);
            EXPECT_EQ(Pruefe([&] { return gen.Bedingungen(0); }), erwartet) << &f - faelle << ": " << tag;
        }
    }
    m.NichtEinteilen = true;   // it and the interval come after the dates
    d.Sperre[0] = 2;
    EXPECT_THROW(gen.Bedingungen(0), Laufzeitfehler);
}

TEST_F(Plan, FewestAssignmentsFirstMetFromTheRandomStartOrAnEligibleSibling)
{
    // for position 2, of four servers: 1 and 2 share name and street, 1 has position 1
    const struct { const char *fall; int p; void (*aendere)(InitMini &); std::vector<double> zahlen; int erwartet; }
        faelle[] = {{"2,1,1 start 2", 1, [](InitMini &g) { g.Einsaetze = {2, 1, 1, 0}; }, {0.8}, 2},
                    {"2,1,1 start 0", 1, [](InitMini &g) { g.Einsaetze = {2, 1, 1, 0}; }, {0.0}, 1},
                    {"2,1,1 start 1", 1, [](InitMini &g) { g.Einsaetze = {2, 1, 1, 0}; }, {0.4}, 1},
                    {"sibling", 2, [](InitMini &) {}, {0.9}, 2},
                    {"fewer elsewhere", 2, [](InitMini &g) { g.Einsaetze[2] = 1; }, {0.0}, 3},
                    {"sibling not eligible", 2, [](InitMini &g) { g.Minis[2].NichtEinteilen = true; }, {0.0, 0.0}, 0},
                    {"rule off", 2, [](InitMini &g) { g.Geschwister = false; }, {0.0}, 0},
                    {"other case", 2, [](InitMini &g) { g.Minis[2].Strasse = QStringLiteral("w1"); }, {0.0}, 0}};
    for (const auto &f : faelle) {
        d = Gemeinde(f.p + 2);
        d.Minis[2].Name = d.Minis[1].Name;
        d.Minis[2].Strasse = d.Minis[1].Strasse;
        f.aendere(d);
        if (f.p == 2) {
            ASSERT_EQ(waehle({0.30}), 1);
            gen.BucheEinsatz();
        }
        EXPECT_EQ(waehle(f.zahlen, f.p), f.erwartet) << f.fall;
    }

    d = Gemeinde(13);   // eleven sibling candidates in a ring; a twelfth fails
    for (Mini &m : d.Minis)
        m.Name = m.Strasse = QStringLiteral("Huber");
    d.Minis[12].Name = QStringLiteral("Meier");
    d.Sperre[11] = 1;
    gen.MemName = gen.MemStrasse = QStringLiteral("Huber");
    gen.Wahl = 0;
    EXPECT_EQ(waehle({0.5}, 2), 6);   // candidate 5 of 1..11
    gen.Wahl = 0;
    EXPECT_EQ(waehle({0.95}, 2), 1);   // the last candidate is blocked: on to the first
    d.Minis[12].Name = QStringLiteral("Huber");
    gen.Wahl = 0;
    EXPECT_THROW(gen.WaehleMini(2), Laufzeitfehler);
}

TEST_F(Plan, PeriodChecksKeepTheOldPlanUnlessTheyPass)
{
    const QString frage = QStringLiteral("Planberechnung: Sie wollen einen Plan der Dauer  %1 Tage berechnen. "
                                         "Ist dies korrekt? [3 0]");
    const struct { const char *start, *ende; Ergebnis ergebnis; QStringList boxen; Antwort antwort = Antwort::Ja; }
        faelle[] = {
            {"07.03.2027", "7.3.27", Ergebnis::Fertig, {}}, {"01.01.2027", "11.04.2027", Ergebnis::Fertig, {}},
            {"01.01.2027", "12.04.2027", Ergebnis::Abgelehnt, {frage.arg(101)}, Antwort::Nein},
            {"01.01.2027", "12.04.2027", Ergebnis::Fertig, {frage.arg(101)}},
            {"01.01.2028", "31.12.2028", Ergebnis::Fertig, {frage.arg(365)}},
            {"01.01.2027", "02.01.2028", Ergebnis::Abgelehnt,
             {frage.arg(366), QStringLiteral("Zeitspanne zu groß: Planberechnung über ein Jahr macht keinen Sinn! "
                                             "\r\r\nBitte wählen Sie die Zeitspanne kleiner! [0 1]")}},
            {"02.03.2027", "01.03.2027", Ergebnis::Abgelehnt,
             {QStringLiteral("Fehler im Datum: Datum wurde falsch angegeben! [0 1]")}},
            {"01.03.2027", "", Ergebnis::Fehler, {FehlerBox}}, {"31.02.2027", "1.3.27", Ergebnis::Fehler, {FehlerBox}},
            {"01.01.1900", "01.01.2000", Ergebnis::Fehler, {FehlerBox}},   // beyond 16 bits
            {"01.01.2000", "01.01.1900", Ergebnis::Fehler, {FehlerBox}}};
    for (const auto &f : faelle) {
        SCOPED_TRACE(std::string(f.start) + " - " + f.ende);
        d.Plan.assign(1, PlanEintrag());
        d.AnzahlPlanEintraege = 1;
        d.Geaendert = false;
        meldungen.leeren();
        meldungen.antworte(f.antwort);
        zufall = TestZufall();
        fortschritt.clear();
        EXPECT_EQ(erstelle(f.start, f.ende, 0), f.ergebnis);
        EXPECT_EQ(boxen(), f.boxen);
        const bool fertig = f.ergebnis == Ergebnis::Fertig;
        EXPECT_EQ(d.AnzahlPlanEintraege + d.Plan.size(), fertig ? 0u : 2u);
        EXPECT_EQ(d.Geaendert, fertig);
        EXPECT_EQ(zufall.starts(), fertig ? 1 : 0);
        EXPECT_EQ(zufall.letzterStartwert(), fertig ? 34200250u : 0u);   // the time of day in milliseconds
        EXPECT_EQ(qint64(fortschritt.size()), fertig ? LeseDatum(f.start)->daysTo(*LeseDatum(f.ende)) : 0);
    }
}

TEST_F(Plan, ServicesInDayThenSlotOrderWithTheLeadingNumberOfTheirCounts)
{
    d = Gemeinde(10);
    d.Intervall = 0;
    Dienste(d, 1, {"2,5", "2.5", "3.5", " 3 Minis"});
    Dienste(d, 2, {"", "0", "-1", "x"});
    Dienste(d, 3, {"0.5", "0.6", "", "&H2"});
    EXPECT_EQ(erstelle("7.3.27", "09.03.2027"), Ergebnis::Fertig);
    EXPECT_EQ(plan(), (QStringList{"07.03.2027 Zeit 1 x2: V0 N0,V1 N1", "07.03.2027 Zeit 2 x2: V2 N2,V3 N3",
                                   "07.03.2027 Zeit 3 x4: V4 N4,V5 N5,V6 N6,V7 N7",
                                   "07.03.2027 Zeit 4 x3: V8 N8,V9 N9,V0 N0", "09.03.2027 Zeit 2 x1: V1 N1",
                                   "09.03.2027 Zeit 4 x2: V2 N2,V3 N3"}));
    EXPECT_EQ(d.Plan[0].Wochentag + d.Plan[5].Wochentag, QStringLiteral("SonntagDienstag"));
}

TEST_F(Plan, PositionsAfterTheFirstThatFindsNobodyStayEmpty)
{
    const struct { int minis; int16_t intervall; const char *anzahl, *ende; int zahlen; QStringList plan; } faelle[] = {
        {0, 2, "3", "08.03.2027", 2, {"07.03.2027 Zeit 1 x3: ", "08.03.2027 Zeit 1 x3: "}},
        {1, 0, "2", "07.03.2027", 4, {"07.03.2027 Zeit 1 x2: V0 N0", "07.03.2027 Zeit 2 x2: V0 N0"}},
        {1, -3, "2", "07.03.2027", 4, {"07.03.2027 Zeit 1 x2: V0 N0", "07.03.2027 Zeit 2 x2: V0 N0"}},
        {4, 2, "4", "07.03.2027", 3, {"07.03.2027 Zeit 1 x4: V0 N0,V2 N2"}},
        {3, 2, "1", "12.03.2027", 6,   // the interval counts services across days
         {"07.03.2027 Zeit 1 x1: V0 N0", "08.03.2027 Zeit 1 x1: V1 N1", "09.03.2027 Zeit 1 x1: V2 N2",
          "10.03.2027 Zeit 1 x1: V0 N0", "11.03.2027 Zeit 1 x1: V1 N1", "12.03.2027 Zeit 1 x1: V2 N2"}}};
    for (const auto &f : faelle) {
        d = Gemeinde(f.minis);
        d.Intervall = f.intervall;
        Dienste(d, 0, {f.anzahl, f.minis == 1 ? f.anzahl : ""});
        if (f.minis == 4) {
            d.Minis[1].NichtEinteilen = true;
            d.Minis[3].Ausgenommen[1] = true;   // Sunday
        }
        EXPECT_EQ(erstelle("07.03.2027", f.ende, f.zahlen), Ergebnis::Fertig);
        EXPECT_EQ(plan(), f.plan);
        EXPECT_EQ(zufall.uebrig(), 0u);   // one random number per attempted position
    }
}

TEST_F(Plan, ExceptionPageReplacesTheWholeDayAnUnreadableOneFailsWhenReached)
{
    d = Gemeinde(5);
    Dienste(d, 0, {"1", "1"});
    d.Ausnahmen = {Seite("", {"3"}), Seite("02.03.2027", {"", "", "", "2"}), Seite("02.03.2027", {"1"}),
                   Seite("03.03.2027", {"0", "0"}), Seite("1.3.", {"1"}), Seite("01.03.2027", {"1"})};
    d.AnzahlAusnahmen = 4;
    EXPECT_EQ(erstelle("01.03.2027", "04.03.2027"), Ergebnis::Fertig);
    EXPECT_EQ(plan(), (QStringList{"01.03.2027 Zeit 1 x1: V0 N0", "01.03.2027 Zeit 2 x1: V1 N1",
                                   "02.03.2027 Zeit 4 x2: V2 N2,V3 N3", "04.03.2027 Zeit 1 x1: V4 N4",
                                   "04.03.2027 Zeit 2 x1: V0 N0"}));

    d.AnzahlAusnahmen = 6;
    d.Geaendert = false;
    fortschritt.clear();
    EXPECT_EQ(erstelle("02.03.2027", "05.03.2027"), Ergebnis::Fehler);
    EXPECT_EQ(boxen(), QStringList{FehlerBox});
    EXPECT_EQ(plan(), QStringList{"02.03.2027 Zeit 4 x2: V1 N1,V2 N2"});
    EXPECT_EQ(fortschritt, (std::vector<int>{33, 66}));   // whole percent
    EXPECT_FALSE(d.Geaendert);
}

TEST_F(Plan, FailureKeepsTheEntriesSoFarAndTheCountersButNothingOfTheOldPlan)
{
    d.Intervall = 0;
    Dienste(d, 0, {"3", "3"});
    ASSERT_EQ(erstelle("01.03.2027", "03.03.2027"), Ergebnis::Fertig);   // six full entries to be reused
    EXPECT_EQ(fortschritt, (std::vector<int>{50, 100}));   // after every day but the last
    Dienste(d, 0, {"2", ""});
    d.Geaendert = false;
    d.Minis[2].Termine[0] = QStringLiteral("01.03.2027-01.03.2027");
    d.Minis[2].Termine[1] = QStringLiteral("02.03.2027-");
    d.Minis[2].AnzahlTermine = 2;
    EXPECT_EQ(erstelle("01.03.2027", "03.03.2027"), Ergebnis::Fehler);
    EXPECT_EQ(boxen(), QStringList{FehlerBox});
    // day 1 complete; the entry of day 2 was added before its first choice failed
    EXPECT_EQ(plan(), (QStringList{"01.03.2027 Zeit 1 x2: V0 N0,V1 N1", "02.03.2027 Zeit 1 x2: "}));
    EXPECT_EQ(d.Plan.size(), 2u);
    EXPECT_EQ(d.Einsaetze, (std::vector<int16_t>{7, 7, 6, 0}));
    EXPECT_FALSE(d.Geaendert);
}

TEST_F(Plan, CountsBeyondTheirLimitsFail)
{
    d = Gemeinde(50);   // an entry claiming more places than it has would make the saved file unreadable
    Dienste(d, 1, {"41"});
    Dienste(d, 2, {"1", "42"});
    EXPECT_EQ(erstelle("07.03.2027", "08.03.2027"), Ergebnis::Fehler);
    ASSERT_EQ(d.AnzahlPlanEintraege, 2);
    EXPECT_EQ(d.Plan[0].Name[40], QStringLiteral("N40"));
    Dienste(d, 1, {"1", "", "", "40000"});   // outside 16 bits: fails before the day's first entry
    EXPECT_EQ(erstelle("07.03.2027", "07.03.2027"), Ergebnis::Fehler);
    EXPECT_EQ(d.AnzahlPlanEintraege, 0);
    Dienste(d, 3, {"1"});
    d.Einsaetze.assign(51, 32767);
    EXPECT_EQ(erstelle("09.03.2027", "09.03.2027"), Ergebnis::Fehler);
    d.Einsaetze.assign(51, 0);
    d.Intervall = 32767;   // Sperre = Intervall + 1
    EXPECT_EQ(erstelle("09.03.2027", "09.03.2027"), Ergebnis::Fehler);
}

bool Geeignet(const InitMini &d, int i, const QDate &tag)
{
    const Mini &m = d.Minis[std::size_t(i)];
    if (m.Ausgenommen[WochentagVon(tag)])
        return false;
    for (int k = 0; k < m.AnzahlTermine; ++k) {
        if (k >= MaxTermine)
            throw Laufzeitfehler("Index");
        const QString &t = m.Termine[k];
        const int j = int(t.indexOf(u'-'));
        const QDate von = t.isEmpty() ? QDate() : LeseDatumOderFehler(j < 0 ? t : t.left(j));
        const QDate bis = j < 0 ? von : LeseDatumOderFehler(t.mid(j + 1));
        if (von.isValid() && von <= tag && tag <= bis)
            return false;
    }
    return d.Sperre[std::size_t(i)] <= 0 && !m.NichtEinteilen;
}

TEST(Eigenschaften, EveryChoiceEligibleFewestNoPlaceLeftEmptyAndFailuresWhereTheRulesFail)
{
    const char *kaputt[] = {"kaputt", "31.02.2027", "01.03.2027-", "-01.03.2027", "1.3"};
    const char *anzahlen[] = {"", "", "0", "1", "2", "3", "4", "2.5", "x"};
    int plaetze = 0, leer = 0, fehler = 0;
    for (uint32_t seed = 1; seed <= 200; ++seed) {
        SCOPED_TRACE(seed);
        // up to 40 servers in families of at most 9, every fourth roster with unreadable dates
        std::mt19937 rng(seed);
        auto zahl = [&rng](int von, int bis) { return std::uniform_int_distribution<int>(von, bis)(rng); };
        const QDate start = QDate(2027, 3, 1).addDays(zahl(0, 30)), ende = start.addDays(zahl(0, 60));
        auto tag = [&](int rand) { return DatumText(start.addDays(zahl(-rand, int(start.daysTo(ende)) + rand))); };
        const bool fehlerhaft = zahl(0, 3) == 0;
        const int n = zahl(0, 40), familien = n / zahl(1, 9) + 1;
        InitMini d = Gemeinde(n);
        for (int i = 0; i < n; ++i) {
            Mini &m = d.Minis[std::size_t(i)];
            m.Name = QStringLiteral("F%1").arg(i % familien);
            m.Strasse = QStringLiteral("S%1").arg(zahl(0, 1));
            for (int w = 1; w <= 7; ++w)
                m.Ausgenommen[w] = zahl(0, 9) == 0;
            m.NichtEinteilen = zahl(0, 19) == 0;
            m.AnzahlTermine = int16_t(fehlerhaft && zahl(0, 49) == 0 ? 32 : zahl(0, 6));
            for (int k = 0; k < MaxTermine; ++k) {
                const int art = zahl(0, 20);
                const bool darf = fehlerhaft || k >= m.AnzahlTermine;   // texts beyond the count are never read
                m.Termine[k] = art == 0 && darf ? QString::fromLatin1(kaputt[zahl(0, 4)])
                               : art < 5        ? QString()
                               : art < 12       ? tag(5)
                                                : tag(10) + u'-' + tag(10);   // sometimes reversed
            }
            d.Einsaetze[std::size_t(i)] = int16_t(zahl(0, 3));
            d.Sperre[std::size_t(i)] = int16_t(zahl(0, 3));
        }
        d.Intervall = int16_t(zahl(0, 4));
        d.Geschwister = zahl(0, 3) > 0;
        for (int w = 1; w <= 7; ++w)
            Dienste(d, w, {anzahlen[zahl(0, 8)], anzahlen[zahl(0, 8)], anzahlen[zahl(0, 8)], anzahlen[zahl(0, 8)]});

        StandardZufall zufall(seed);
        PlanGenerator gen(d, zufall);
        for (QDate tag = start.addDays(-3); tag <= ende.addDays(3); tag = tag.addDays(4)) {
            gen.AktDatum = tag;
            for (int i = 0; i < n; ++i)
                ASSERT_EQ(Pruefe([&] { return gen.Bedingungen(int16_t(i)); }),
                          Pruefe([&] { return Geeignet(d, i, tag); }))
                    << "server " << i << " on " << qPrintable(DatumText(tag));
        }

        // Replay the plan on the counters as they were before; their Sperre is the interval rule.
        InitMini nach = d;
        TestMeldungen meldungen;
        const auto ergebnis = gen.BtnErstellen_Click(DatumText(start), DatumText(ende), meldungen, TestUhr());
        int gescheitert = -1;
        for (int e = 0; e < d.AnzahlPlanEintraege && gescheitert < 0; ++e) {
            const PlanEintrag &p = d.Plan[std::size_t(e)];
            for (int k = 0; k < p.MiniAnz; ++k) {
                std::vector<int> frei;
                int wenigste = INT_MAX;
                for (int i = 0; i < n && gescheitert < 0; ++i) {
                    const int g = Pruefe([&] { return Geeignet(nach, i, *LeseDatum(p.Datum)); });
                    gescheitert = g < 0 ? e : -1;
                    if (g > 0) {
                        frei.push_back(i);
                        wenigste = std::min<int>(wenigste, nach.Einsaetze[std::size_t(i)]);
                    }
                }
                if (gescheitert >= 0 || p.Vorname[k].isEmpty()) {
                    ASSERT_TRUE(gescheitert >= 0 || frei.empty()) << "entry " << e << " place " << k;
                    ASSERT_EQ(std::count(p.Vorname.begin() + k, p.Vorname.end(), QString()), MaxPlaetze - k);
                    leer += gescheitert < 0;
                    break;
                }
                const int s = p.Vorname[k].mid(1).toInt();
                ASSERT_TRUE(std::count(frei.begin(), frei.end(), s) && nach.Einsaetze[std::size_t(s)] == wenigste)
                    << "entry " << e << " place " << k;
                ++nach.Einsaetze[std::size_t(s)];
                nach.Sperre[std::size_t(s)] = int16_t(nach.Intervall + 1);
                ++plaetze;
            }
            for (int16_t &s : nach.Sperre)
                s = int16_t(gescheitert < 0 ? std::max(0, s - 1) : s);
        }
        ASSERT_EQ(ergebnis, gescheitert < 0 ? Ergebnis::Fertig : Ergebnis::Fehler);
        ASSERT_TRUE(gescheitert < 0 || gescheitert == d.AnzahlPlanEintraege - 1);
        fehler += gescheitert >= 0;
        EXPECT_EQ(nach.Einsaetze, d.Einsaetze);
        EXPECT_EQ(nach.Sperre, d.Sperre);
    }
    EXPECT_GT(plaetze, 10000);   // the data reached every outcome
    EXPECT_GT(leer, 500);
    EXPECT_GT(fehler, 20);
}

} // namespace
