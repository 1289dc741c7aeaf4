#include "data/DatenDatei.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <csignal>
#include <sys/resource.h>
#include <tuple>

namespace {

QString Testdatei(const char *name)
{
    return QStringLiteral(PRADILON_TESTDATEN "/") + QString::fromUtf8(name);
}

QByteArray Inhalt(const QString &pfad)
{
    QFile f(pfad);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray("<fehlt>");
}

QByteArray Gold(const char *name)
{
    return Inhalt(Testdatei(name));
}

QByteArray Bytes(const InitMini &d)
{
    QByteArray b;
    EXPECT_TRUE(SchreibeDaten(d, b));
    return b;
}

void ErwarteEineMeldung(const TestMeldungen &m, const QString &text, const QString &titel)
{
    ASSERT_EQ(m.gezeigt().size(), 1u);
    EXPECT_EQ(m.gezeigt()[0].text, text);
    EXPECT_EQ(m.gezeigt()[0].titel, titel);
    EXPECT_EQ(m.gezeigt()[0].symbol, Symbol::Kritisch);
    EXPECT_EQ(m.gezeigt()[0].knoepfe, Knoepfe::OK);
}

// The data of zwei-minis-ausnahme-plan.prd, built by hand: umlauts, a comma, quotes, blanks at both
// ends, an excluded range, a text beyond AnzahlTermine and a place left empty.
InitMini ZweiMinis()
{
    InitMini d;
    d.AnzahlMinis = 2;
    d.Minis.resize(3);
    // Name, Vorname, Strasse, Telefon, Ort, Ausgenommen, Termine, AnzahlTermine, Oberministrant, NichtEinteilen
    d.Minis[0] = {"Müller", "Jörg", "Hauptstraße 5", "0815/4711", "12345 Großdorf", {0, 1, 0, 0, 0, 0, 0, 1},
                  {"24.12.2002", "01.08.2002-31.08.2002", "bleibt ungeschrieben"}, 2, true, false};
    const Mini &n = d.Minis[1] = {" Meier, \"Sepp\" ", "Anna-Lena", "", "", "", {}, {}, 0, false, true};
    d.Regulaer[1] = {{"9.30", "11:00", "", ""}, {"4", "3 Minis", "", ""}};
    d.Regulaer[4] = {{"19.00", "", "", ""}, {"2", "", "", ""}};
    d.AnzahlAusnahmen = 1;
    d.Ausnahmen.resize(2);
    d.Ausnahmen[0] = {"25.12.2002", {"10.00", "18.30", "", ""}, {"5", "2", "", ""}};
    d.AnzahlPlanEintraege = 2;
    d.Plan.resize(3);
    d.Plan[0] = {"22.12.2002", "Sonntag", "9.30", 2, {"Müller"}, {"Jörg"}};
    d.Plan[1] = {"25.12.2002", "Mittwoch", "10.00", 1, {n.Name}, {n.Vorname}};
    d.Intervall = 3;
    d.Geschwister = false;
    return d;
}

// Everything a load may change, to prove that a failed load changed nothing.
auto StandVon(const InitMini &d)
{
    return std::make_tuple(Bytes(d), d.Sperre, d.Einsaetze, d.Minis.size(), d.Ausnahmen.size(), d.Plan.size(),
                           d.Dateiname, d.Geaendert);
}

} // namespace

TEST(DatenDatei, SchreibtByteFuerByteWieDieHandgeschriebenenDateien)
{
    const QByteArray leer = Gold("leer-62-zeilen.prd");
    EXPECT_EQ(leer.count("\r\n"), 62);
    EXPECT_EQ(Bytes(InitMini()), leer);
    EXPECT_EQ(Bytes(ZweiMinis()), Gold("zwei-minis-ausnahme-plan.prd"));

    // A count beyond its array is refused instead of read past the end.
    InitMini d = ZweiMinis();
    d.AnzahlMinis = 4;
    QByteArray b;
    QString fehler;
    EXPECT_FALSE(SchreibeDaten(d, b, &fehler));
    EXPECT_FALSE(fehler.isEmpty());
}

TEST(DatenDatei, LadenUndSpeichernGibtDieselbenBytes)
{
    const QByteArray leer = Gold("leer-62-zeilen.prd");
    const QByteArray zwei = Gold("zwei-minis-ausnahme-plan.prd");
    // A lone LF and a missing last line end read as line ends; a negative count of dates or places
    // means none and is kept as 0, so nothing indexes with it.
    const std::pair<const char *, QByteArray> faelle[] = {
        {"leer-62-zeilen.prd", leer},
        {"zwei-minis-ausnahme-plan.prd", zwei},
        {"termine-31.prd", Gold("termine-31.prd")},
        {"plaetze-41.prd", Gold("plaetze-41.prd")},
        {"alle-bytes.prd", Gold("alle-bytes.prd")},
        {"zwei-minis-ausnahme-plan-lf.prd", zwei},
        {"ohne-letztes-zeilenende.prd", leer},
        {"termine-negativ.prd", Gold("termine-negativ.prd").replace("\n-3 \r", "\n 0 \r")},
        {"plaetze-negativ.prd", Gold("plaetze-negativ.prd").replace("\n-1 \r", "\n 0 \r")},
    };
    for (const auto &[name, erwartet] : faelle) {
        InitMini d;
        LeseFehler fehler;
        ASSERT_TRUE(LeseDatei(Testdatei(name), d, &fehler)) << name << ": " << fehler.grund.toStdString();
        EXPECT_EQ(Bytes(d), erwartet) << name;
    }
}

TEST(DatenDatei, LadenSetztDieZaehlerZurueckUndLaesstDenRestStehen)
{
    InitMini d;
    d.Wochentag[1] = "So";
    d.TagesZeit[2] = "8.00";
    d.TagesMiniAnz[3] = 5;
    d.AlterDateiname = "alt.prd";
    d.DateiLaden = d.DateiSpeichernUnter = d.Geaendert = true;
    d.Sperre = d.Einsaetze = {4, 4};
    ASSERT_TRUE(LeseDatei(Testdatei("zwei-minis-ausnahme-plan.prd"), d));
    EXPECT_EQ(d.Minis.size(), 3u);
    EXPECT_EQ(d.Sperre, std::vector<int16_t>(3, 0));
    EXPECT_EQ(d.Einsaetze, std::vector<int16_t>(3, 0));
    EXPECT_TRUE(d.Wochentag[1] == "So" && d.TagesZeit[2] == "8.00" && d.TagesMiniAnz[3] == 5);
    EXPECT_TRUE(d.AlterDateiname == "alt.prd" && d.DateiLaden && d.DateiSpeichernUnter && d.Geaendert);
}

TEST(DatenDatei, ZahlFlagUndTextZeilen)
{
    const QByteArray leer = Gold("leer-62-zeilen.prd");
    InitMini d;
    for (const auto &[zeile, wert] : {std::pair{"2", 2}, {"  2  ", 2}, {"\t+2\t", 2}, {"0002", 2}, {"-32768", -32768}}) {
        d.Intervall = 0;
        ASSERT_TRUE(LeseDaten(QByteArray(leer).replace("\r\n 2 \r\n", QByteArray("\r\n") + zeile + "\r\n"), d)) << zeile;
        EXPECT_EQ(d.Intervall, wert) << zeile;
    }
    // Only exactly "T" is true.
    for (const char *zeile : {"t", "T ", " T", "Ja", ""}) {
        d.Geschwister = true;
        ASSERT_TRUE(LeseDaten(QByteArray(leer).replace(leer.size() - 3, 1, zeile), d)) << zeile;
        EXPECT_FALSE(d.Geschwister) << zeile;
    }
    // A lone CR is part of the text; lines after the last one are ignored.
    ASSERT_TRUE(LeseDaten(QByteArray(leer).insert(15, "a\rb").append("Rest\r\n"), d));
    EXPECT_EQ(d.Regulaer[1].Zeit[0], "a\rb");
}

TEST(DatenDatei, JederLesefehlerLaesstDenSpeicherUnveraendert)
{
    const QByteArray leer = Gold("leer-62-zeilen.prd");
    const QByteArray zwei = Gold("zwei-minis-ausnahme-plan.prd");
    const auto intervall = [&](const QByteArray &zeile) { return QByteArray(leer).replace(" 2 \r\n", zeile + "\r\n"); };
    const struct {
        const char *was;
        QByteArray inhalt;
        int zeile;
    } faelle[] = {
        {"leere Datei", Gold("leere-datei.prd"), 1},
        {"Kennung klein", Gold("kennung-kleinbuchstaben.prd"), 1},
        {"Kennung mit Blank", Gold("kennung-leerzeichen.prd"), 1},
        {"nur Kennung", "pRaDiLoN\r\n", 2},
        {"32768", Gold("anzahl-32768.prd"), 2},
        {"Minis negativ", Gold("anzahl-minis-negativ.prd"), 2},
        {"Zahl mit Text", Gold("zahlzeile-mit-text.prd"), 2},
        {"endet nach Intervall", Gold("endet-nach-intervall.prd"), 62},
        {"32 Termine", Gold("termine-32.prd"), 17},
        {"42 Plätze", Gold("plaetze-42.prd"), 64},
        {"Ausnahmen negativ", QByteArray(leer).replace("\r\n\r\n 0 \r\n 0 \r\n", "\r\n\r\n-1 \r\n 0 \r\n"), 59},
        {"Plan negativ", QByteArray(leer).replace(" 0 \r\n 2 \r\n", "-2 \r\n 2 \r\n"), 60},
        {"leere Zahlzeile", intervall(""), 61},
        {"nur Blanks", intervall("   "), 61},
        {"zwei Zahlen", intervall(" 1 2 "), 61},
        {"Dezimalpunkt", intervall(" 2.0 "), 61},
        {"Hex", intervall("&H2"), 61},
        {"nur Vorzeichen", intervall(" - "), 61},
        {"-32769", intervall("-32769"), 61},
        {"riesige Zahl", intervall(QByteArray(50, '9')), 61},
        {"mitten im Mini", zwei.left(zwei.indexOf("Anna-Lena")), 21},
        {"mitten im Plan", zwei.left(zwei.indexOf("Mittwoch")), 111},
    };
    for (const auto &f : faelle) {
        InitMini d = ZweiMinis();
        d.Sperre = {1, 2, 3};
        d.Einsaetze = {4, 5, 6};
        const auto vorher = StandVon(d);
        LeseFehler fehler;
        EXPECT_FALSE(LeseDaten(f.inhalt, d, &fehler)) << f.was;
        EXPECT_EQ(fehler.zeile, f.zeile) << f.was << ": " << fehler.grund.toStdString();
        EXPECT_TRUE(StandVon(d) == vorher) << f.was;
    }
}

TEST(DatenDatei, LadenMeldetFehlerEinmalUndStelltDenNamenZurueck)
{
    QTemporaryDir ordner;
    for (const QString &pfad : {Testdatei("termine-32.prd"), ordner.path() + "/fehlt.prd", ordner.path()}) {
        InitMini d = ZweiMinis();
        d.Dateiname = pfad;
        d.AlterDateiname = "C:\\alt.prd";
        const QByteArray vorher = Bytes(d);
        TestMeldungen meldungen;
        EXPECT_FALSE(Laden(d, meldungen));
        ErwarteEineMeldung(meldungen, "Dies ist keine Pradilon-Datei! Die Datei konnte nicht geöffnet werden! ",
                           "Fehler beim Öffnen");
        EXPECT_EQ(d.Dateiname, "C:\\alt.prd");
        EXPECT_EQ(Fenstertitel(d), "Ministrantenplan - C:\\ALT.PRD");
        EXPECT_EQ(Bytes(d), vorher);
    }

    InitMini d;
    d.Dateiname = Testdatei("zwei-minis-ausnahme-plan.prd");
    TestMeldungen meldungen;
    EXPECT_TRUE(Laden(d, meldungen));
    EXPECT_TRUE(meldungen.gezeigt().empty());
    EXPECT_EQ(d.Dateiname, Testdatei("zwei-minis-ausnahme-plan.prd"));
    EXPECT_EQ(d.AnzahlMinis, 2);
}

// Every save goes to plan.prd, which holds "alt" beforehand, unless a test says otherwise.
class Sichern : public ::testing::Test
{
protected:
    QTemporaryDir m_ordner;
    TestMeldungen m_meldungen;
    InitMini m_daten = ZweiMinis();

    void SetUp() override
    {
        QFile alt(pfad("plan.prd"));
        ASSERT_TRUE(alt.open(QIODevice::WriteOnly) && alt.write("alt") == 3);
        m_daten.Dateiname = pfad("plan.prd");
        m_daten.Geaendert = true;
    }

    QString pfad(const char *name) const { return m_ordner.filePath(QString::fromUtf8(name)); }

    // The message comes once, Geaendert stays true and the old file and the folder are untouched.
    void erwarteFehlschlag(SpeicherErgebnis ergebnis)
    {
        EXPECT_EQ(ergebnis, SpeicherErgebnis::Fehlgeschlagen);
        ErwarteEineMeldung(m_meldungen, "Dateiname oder Pfadangabe ungültig! Datei konnte nicht gesichert werden.",
                           "Fehler beim Sichern");
        EXPECT_TRUE(m_daten.Geaendert);
        EXPECT_EQ(Inhalt(pfad("plan.prd")), "alt");
        EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"plan.prd"});
    }
};

TEST_F(Sichern, SchreibtNurWennGeaendertUndErsetztDieAlteDatei)
{
    m_daten.Geaendert = false;
    m_daten.Dateiname = pfad("neu.prd");
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::NichtsGeaendert);
    EXPECT_FALSE(QFile::exists(m_daten.Dateiname));

    m_daten.Geaendert = true;
    m_daten.Dateiname = pfad("plan.prd");
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::Gespeichert);
    EXPECT_FALSE(m_daten.Geaendert);
    EXPECT_TRUE(m_meldungen.gezeigt().empty());
    EXPECT_EQ(Inhalt(m_daten.Dateiname), Gold("zwei-minis-ausnahme-plan.prd"));
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"plan.prd"});
}

TEST_F(Sichern, NachDemFehlschlagBleibtDerNameNurUnterNeuemNamenNicht)
{
    // A plain save keeps its target; a save under a new name goes back to AlterDateiname, which is
    // empty before the browser was ever shown.
    const struct {
        QString ziel, alter;
        bool unter;
        QString danach;
    } faelle[] = {
        {pfad("fehlt/plan.prd"), pfad("anders.prd"), false, pfad("fehlt/plan.prd")},
        {pfad("plan.prd/neu.prd"), pfad("anders.prd"), true, pfad("anders.prd")},
        {"", "", true, ""},
    };
    for (const auto &f : faelle) {
        m_meldungen.leeren();
        m_daten.Dateiname = f.ziel;
        m_daten.AlterDateiname = f.alter;
        m_daten.Geaendert = true;
        erwarteFehlschlag(Speichern(m_daten, m_meldungen, f.unter));
        EXPECT_EQ(m_daten.Dateiname, f.danach);
        EXPECT_EQ(Fenstertitel(m_daten), "Ministrantenplan - " + f.danach.toUpper());
    }
}

TEST_F(Sichern, ZeichenAusserhalbDerCodeseiteOderZeilenumbruchLassenDieAlteDateiStehen)
{
    m_daten.Ausnahmen[0].Zeit[3] = QString::fromUtf8("10 Uhr ✝");
    erwarteFehlschlag(Speichern(m_daten, m_meldungen, false));
    // A line feed inside a text would shift every later line of the file.
    m_meldungen.leeren();
    m_daten.Ausnahmen[0].Zeit[3] = QStringLiteral("10\nUhr");
    erwarteFehlschlag(Speichern(m_daten, m_meldungen, false));
}

TEST_F(Sichern, SchreibfehlerMittendrinLaesstDieAlteDateiStehen)
{
    // A file size limit makes the write fail part-way, like a full disk, even for root.
    m_daten.AnzahlMinis = 2000;
    m_daten.Minis.resize(2001, m_daten.Minis[0]);
    rlimit alt{};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &alt), 0);
    rlimit klein = alt;
    klein.rlim_cur = 4096;
    const auto vorherigesSignal = std::signal(SIGXFSZ, SIG_IGN);
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &klein), 0);
    const SpeicherErgebnis ergebnis = Speichern(m_daten, m_meldungen, false);
    setrlimit(RLIMIT_FSIZE, &alt);
    std::signal(SIGXFSZ, vorherigesSignal);
    erwarteFehlschlag(ergebnis);
}
