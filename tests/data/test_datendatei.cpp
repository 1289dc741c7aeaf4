#include "data/DatenDatei.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <csignal>
#include <sys/resource.h>
#include <unistd.h>

namespace {

const QString LeseFehlerText = QStringLiteral("Dies ist keine Pradilon-Datei! Die Datei konnte nicht geöffnet werden! ");
const QString SchreibFehlerText = QStringLiteral("Dateiname oder Pfadangabe ungültig! Datei konnte nicht gesichert werden.");

QString Testdatei(const char *name)
{
    return QStringLiteral(PRADILON_TESTDATEN "/") + QString::fromUtf8(name);
}

QByteArray Inhalt(const QString &pfad)
{
    QFile f(pfad);
    if (!f.open(QIODevice::ReadOnly))
        return QByteArray("<fehlt>");
    return f.readAll();
}

void Schreibe(const QString &pfad, const QByteArray &inhalt)
{
    QFile f(pfad);
    ASSERT_TRUE(f.open(QIODevice::WriteOnly));
    ASSERT_EQ(f.write(inhalt), inhalt.size());
}

QByteArray Bytes(const InitMini &d)
{
    QByteArray b;
    EXPECT_TRUE(SchreibeDaten(d, b));
    return b;
}

// The data of zwei-minis-ausnahme-plan.prd, built by hand.
InitMini ZweiMinis()
{
    InitMini d;
    d.AnzahlMinis = 2;
    d.Minis.resize(3);
    Mini &m = d.Minis[0];
    m.Name = "Müller";
    m.Vorname = "Jörg";
    m.Strasse = "Hauptstraße 5";
    m.Ort = "12345 Großdorf";
    m.Telefon = "0815/4711";
    m.Oberministrant = true;
    m.Ausgenommen[1] = m.Ausgenommen[7] = true;
    m.AnzahlTermine = 2;
    m.Termine[0] = "24.12.2002";
    m.Termine[1] = "01.08.2002-31.08.2002";
    m.Termine[2] = "bleibt ungeschrieben";
    Mini &n = d.Minis[1];
    n.Name = " Meier, \"Sepp\" ";
    n.Vorname = "Anna-Lena";
    n.NichtEinteilen = true;
    d.Regulaer[1].Zeit = {"9.30", "11:00", "", ""};
    d.Regulaer[1].MiniAnz = {"4", "3 Minis", "", ""};
    d.Regulaer[4].Zeit[0] = "19.00";
    d.Regulaer[4].MiniAnz[0] = "2";
    d.AnzahlAusnahmen = 1;
    d.Ausnahmen.resize(2);
    d.Ausnahmen[0].Datum = "25.12.2002";
    d.Ausnahmen[0].Zeit = {"10.00", "18.30", "", ""};
    d.Ausnahmen[0].MiniAnz = {"5", "2", "", ""};
    d.AnzahlPlanEintraege = 2;
    d.Plan.resize(3);
    d.Plan[0].Datum = "22.12.2002";
    d.Plan[0].Wochentag = "Sonntag";
    d.Plan[0].Zeit = "9.30";
    d.Plan[0].MiniAnz = 2;
    d.Plan[0].Name[0] = "Müller";
    d.Plan[0].Vorname[0] = "Jörg";
    d.Plan[1].Datum = "25.12.2002";
    d.Plan[1].Wochentag = "Mittwoch";
    d.Plan[1].Zeit = "10.00";
    d.Plan[1].MiniAnz = 1;
    d.Plan[1].Name[0] = n.Name;
    d.Plan[1].Vorname[0] = n.Vorname;
    d.Intervall = 3;
    d.Geschwister = false;
    return d;
}

// Everything a load may change or must leave alone, to prove a failed load changed nothing.
struct Stand {
    QByteArray bytes;
    std::vector<int16_t> sperre, einsaetze;
    std::size_t minis, ausnahmen, plan;
    QString dateiname;
    bool geaendert;
    bool operator==(const Stand &o) const
    {
        return bytes == o.bytes && sperre == o.sperre && einsaetze == o.einsaetze && minis == o.minis
               && ausnahmen == o.ausnahmen && plan == o.plan && dateiname == o.dateiname && geaendert == o.geaendert;
    }
};

Stand StandVon(const InitMini &d)
{
    return {Bytes(d), d.Sperre, d.Einsaetze, d.Minis.size(), d.Ausnahmen.size(), d.Plan.size(), d.Dateiname, d.Geaendert};
}

} // namespace

TEST(DatenDatei, LeereDatenSind62Zeilen)
{
    const InitMini d;
    const QByteArray erwartet = Inhalt(Testdatei("leer-62-zeilen.prd"));
    EXPECT_EQ(Bytes(d), erwartet);
    EXPECT_EQ(erwartet.count("\r\n"), 62);
}

TEST(DatenDatei, SchreibtJedeZeileWieVorgeschrieben)
{
    EXPECT_EQ(Bytes(ZweiMinis()), Inhalt(Testdatei("zwei-minis-ausnahme-plan.prd")));
}

TEST(DatenDatei, LiestJedesFeldAnSeinePlatz)
{
    InitMini d;
    d.Wochentag[1] = "So";
    d.TagesZeit[2] = "8.00";
    d.TagesMiniAnz[3] = 5;
    d.AlterDateiname = "alt.prd";
    d.DateiLaden = d.DateiSpeichernUnter = d.Geaendert = true;
    d.Sperre = {4, 4};
    d.Einsaetze = {9, 9};
    LeseFehler fehler;
    ASSERT_TRUE(LeseDatei(Testdatei("zwei-minis-ausnahme-plan.prd"), d, &fehler)) << fehler.grund.toStdString();

    InitMini erwartet = ZweiMinis();
    erwartet.Minis[0].Termine[2].clear();   // beyond the count: not in the file
    EXPECT_EQ(Bytes(d), Bytes(erwartet));
    EXPECT_EQ(d.Minis.size(), 3u);
    EXPECT_EQ(d.Sperre, std::vector<int16_t>(3, 0));
    EXPECT_EQ(d.Einsaetze, std::vector<int16_t>(3, 0));
    EXPECT_EQ(d.Ausnahmen.size(), 2u);
    EXPECT_EQ(d.Plan.size(), 3u);
    EXPECT_TRUE(d.Minis[0].Ausgenommen[1] && d.Minis[0].Ausgenommen[7] && !d.Minis[0].Ausgenommen[2]);

    EXPECT_EQ(d.Wochentag[1], "So");
    EXPECT_EQ(d.TagesZeit[2], "8.00");
    EXPECT_EQ(d.TagesMiniAnz[3], 5);
    EXPECT_EQ(d.AlterDateiname, "alt.prd");
    EXPECT_TRUE(d.DateiLaden && d.DateiSpeichernUnter && d.Geaendert);
}

TEST(DatenDatei, LadenUndSpeichernGibtDieselbenBytes)
{
    for (const char *name : {"leer-62-zeilen.prd", "zwei-minis-ausnahme-plan.prd", "termine-31.prd",
                             "plaetze-41.prd", "alle-bytes.prd"}) {
        InitMini d;
        ASSERT_TRUE(LeseDatei(Testdatei(name), d)) << name;
        EXPECT_EQ(Bytes(d), Inhalt(Testdatei(name))) << name;
    }
}

TEST(DatenDatei, ZeilenendenUndLetzteZeile)
{
    InitMini lf, crlf;
    ASSERT_TRUE(LeseDatei(Testdatei("zwei-minis-ausnahme-plan-lf.prd"), lf));
    ASSERT_TRUE(LeseDatei(Testdatei("zwei-minis-ausnahme-plan.prd"), crlf));
    EXPECT_EQ(Bytes(lf), Bytes(crlf));

    InitMini ohneEnde;
    ASSERT_TRUE(LeseDatei(Testdatei("ohne-letztes-zeilenende.prd"), ohneEnde));
    EXPECT_TRUE(ohneEnde.Geschwister);

    // A lone CR is no line end but part of the text; lines after the last one are ignored.
    QByteArray mitCr = Inhalt(Testdatei("leer-62-zeilen.prd"));
    mitCr.replace(15, 0, "a\rb");   // first text line of Regulaer(1)
    mitCr.append("Rest\r\n");
    InitMini d;
    ASSERT_TRUE(LeseDaten(mitCr, d));
    EXPECT_EQ(d.Regulaer[1].Zeit[0], "a\rb");
}

TEST(DatenDatei, ZahlUndFlagZeilen)
{
    const QByteArray leer = Inhalt(Testdatei("leer-62-zeilen.prd"));
    for (const char *zeile : {"2", "  2  ", "\t+2\t", "0002", " 2"}) {
        QByteArray b = leer;
        b.replace("\r\n 2 \r\n", QByteArray("\r\n") + zeile + "\r\n");
        InitMini d;
        d.Intervall = 0;
        EXPECT_TRUE(LeseDaten(b, d)) << zeile;
        EXPECT_EQ(d.Intervall, 2) << zeile;
    }
    QByteArray negativ = leer;
    negativ.replace("\r\n 2 \r\n", "\r\n-32768 \r\n");
    InitMini d;
    ASSERT_TRUE(LeseDaten(negativ, d));
    EXPECT_EQ(d.Intervall, -32768);

    // Only exactly "T" is true.
    for (const char *zeile : {"t", "T ", " T", "Ja", ""}) {
        QByteArray b = leer;
        b.replace(b.size() - 3, 1, zeile);
        ASSERT_TRUE(LeseDaten(b, d)) << zeile;
        EXPECT_FALSE(d.Geschwister) << zeile;
    }
}

TEST(DatenDatei, GrenzenDerTermineUndPlaetze)
{
    InitMini d;
    ASSERT_TRUE(LeseDatei(Testdatei("termine-31.prd"), d));
    EXPECT_EQ(d.Minis[0].AnzahlTermine, 31);
    EXPECT_EQ(d.Minis[0].Termine[30], "31.01.2003");
    ASSERT_TRUE(LeseDatei(Testdatei("plaetze-41.prd"), d));
    EXPECT_EQ(d.Plan[0].MiniAnz, 41);
    EXPECT_EQ(d.Plan[0].Vorname[40], "V40");

    // Negative counts mean no entries and are kept as 0, so nothing indexes with them.
    ASSERT_TRUE(LeseDatei(Testdatei("termine-negativ.prd"), d));
    EXPECT_EQ(d.Minis[0].AnzahlTermine, 0);
    EXPECT_EQ(d.Intervall, 2);
    ASSERT_TRUE(LeseDatei(Testdatei("plaetze-negativ.prd"), d));
    EXPECT_EQ(d.AnzahlPlanEintraege, 1);
    EXPECT_EQ(d.Plan[0].MiniAnz, 0);
    EXPECT_TRUE(d.Geschwister);
}

TEST(DatenDatei, JederLesefehlerLaesstDenSpeicherUnveraendert)
{
    const QByteArray leer = Inhalt(Testdatei("leer-62-zeilen.prd"));
    const QByteArray zwei = Inhalt(Testdatei("zwei-minis-ausnahme-plan.prd"));
    struct Fall {
        const char *was;
        QByteArray inhalt;
        int zeile;
    };
    const std::vector<Fall> faelle = {
        {"leere Datei", Inhalt(Testdatei("leere-datei.prd")), 1},
        {"Kennung klein", Inhalt(Testdatei("kennung-kleinbuchstaben.prd")), 1},
        {"Kennung mit Blank", Inhalt(Testdatei("kennung-leerzeichen.prd")), 1},
        {"nur Kennung", "pRaDiLoN\r\n", 2},
        {"32768", Inhalt(Testdatei("anzahl-32768.prd")), 2},
        {"Minis negativ", Inhalt(Testdatei("anzahl-minis-negativ.prd")), 2},
        {"Zahl mit Text", Inhalt(Testdatei("zahlzeile-mit-text.prd")), 2},
        {"endet nach Intervall", Inhalt(Testdatei("endet-nach-intervall.prd")), 62},
        {"32 Termine", Inhalt(Testdatei("termine-32.prd")), 17},
        {"42 Plätze", Inhalt(Testdatei("plaetze-42.prd")), 64},
        {"Ausnahmen negativ", QByteArray(leer).replace("\r\n\r\n 0 \r\n 0 \r\n", "\r\n\r\n-1 \r\n 0 \r\n"), 59},
        {"Plan negativ", QByteArray(leer).replace(" 0 \r\n 2 \r\n", "-2 \r\n 2 \r\n"), 60},
        {"leere Zahlzeile", QByteArray(leer).replace(" 2 \r\n", "\r\n"), 61},
        {"nur Blanks", QByteArray(leer).replace(" 2 \r\n", "   \r\n"), 61},
        {"zwei Zahlen", QByteArray(leer).replace(" 2 \r\n", " 1 2 \r\n"), 61},
        {"Dezimalpunkt", QByteArray(leer).replace(" 2 \r\n", " 2.0 \r\n"), 61},
        {"Hex", QByteArray(leer).replace(" 2 \r\n", "&H2\r\n"), 61},
        {"nur Vorzeichen", QByteArray(leer).replace(" 2 \r\n", " - \r\n"), 61},
        {"-32769", QByteArray(leer).replace(" 2 \r\n", "-32769\r\n"), 61},
        {"riesige Zahl", QByteArray(leer).replace(" 2 \r\n", QByteArray(50, '9') + "\r\n"), 61},
        {"mitten im Mini", zwei.left(zwei.indexOf("Anna-Lena")), 21},
        {"mitten im Plan", zwei.left(zwei.indexOf("Mittwoch")), 111},
    };
    for (const Fall &f : faelle) {
        InitMini d = ZweiMinis();
        d.Sperre = {1, 2, 3};
        d.Einsaetze = {4, 5, 6};
        const Stand vorher = StandVon(d);
        LeseFehler fehler;
        EXPECT_FALSE(LeseDaten(f.inhalt, d, &fehler)) << f.was;
        EXPECT_EQ(fehler.zeile, f.zeile) << f.was << ": " << fehler.grund.toStdString();
        EXPECT_FALSE(fehler.grund.isEmpty()) << f.was;
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
        ASSERT_EQ(meldungen.gezeigt().size(), 1u);
        EXPECT_EQ(meldungen.gezeigt()[0].text, LeseFehlerText);
        EXPECT_EQ(meldungen.gezeigt()[0].titel, "Fehler beim Öffnen");
        EXPECT_EQ(meldungen.gezeigt()[0].symbol, Symbol::Kritisch);
        EXPECT_EQ(meldungen.gezeigt()[0].knoepfe, Knoepfe::OK);
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

class Sichern : public ::testing::Test
{
protected:
    QTemporaryDir m_ordner;
    TestMeldungen m_meldungen;
    InitMini m_daten = ZweiMinis();

    QString pfad(const char *name) const { return m_ordner.filePath(QString::fromUtf8(name)); }

    void erwarteFehlermeldung()
    {
        ASSERT_EQ(m_meldungen.gezeigt().size(), 1u);
        EXPECT_EQ(m_meldungen.gezeigt()[0].text, SchreibFehlerText);
        EXPECT_EQ(m_meldungen.gezeigt()[0].titel, "Fehler beim Sichern");
        EXPECT_EQ(m_meldungen.gezeigt()[0].symbol, Symbol::Kritisch);
        EXPECT_EQ(m_meldungen.gezeigt()[0].knoepfe, Knoepfe::OK);
        EXPECT_TRUE(m_daten.Geaendert);
    }
};

TEST_F(Sichern, OhneAenderungWirdNichtsGeschrieben)
{
    m_daten.Dateiname = pfad("neu.prd");
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::NichtsGeaendert);
    EXPECT_FALSE(QFile::exists(m_daten.Dateiname));
    EXPECT_TRUE(m_meldungen.gezeigt().empty());
}

TEST_F(Sichern, SchreibtUndErsetztDieAlteDatei)
{
    m_daten.Dateiname = pfad("plan.prd");
    Schreibe(m_daten.Dateiname, "alter Inhalt, der länger ist als nichts");
    m_daten.Geaendert = true;
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::Gespeichert);
    EXPECT_FALSE(m_daten.Geaendert);
    EXPECT_TRUE(m_meldungen.gezeigt().empty());
    EXPECT_EQ(Inhalt(m_daten.Dateiname), Inhalt(Testdatei("zwei-minis-ausnahme-plan.prd")));
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"plan.prd"});
}

TEST_F(Sichern, FehlenderOrdnerBehaeltDenNamenBeimEinfachenSichern)
{
    m_daten.Dateiname = pfad("fehlt/plan.prd");
    m_daten.AlterDateiname = pfad("anders.prd");
    m_daten.Geaendert = true;
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::Fehlgeschlagen);
    erwarteFehlermeldung();
    EXPECT_EQ(m_daten.Dateiname, pfad("fehlt/plan.prd"));
}

TEST_F(Sichern, FehlschlagUnterNeuemNamenStelltDenAltenNamenHer)
{
    m_daten.Dateiname = pfad("ordner-ist-datei.prd/plan.prd");
    Schreibe(pfad("ordner-ist-datei.prd"), "x");
    m_daten.AlterDateiname = pfad("alt.prd");
    m_daten.Geaendert = true;
    EXPECT_EQ(Speichern(m_daten, m_meldungen, true), SpeicherErgebnis::Fehlgeschlagen);
    erwarteFehlermeldung();
    EXPECT_EQ(m_daten.Dateiname, pfad("alt.prd"));

    // Before the browser was ever shown the old name is empty, and so is the title's end.
    m_meldungen.leeren();
    m_daten.Dateiname = "";
    m_daten.AlterDateiname = "";
    EXPECT_EQ(Speichern(m_daten, m_meldungen, true), SpeicherErgebnis::Fehlgeschlagen);
    erwarteFehlermeldung();
    EXPECT_EQ(Fenstertitel(m_daten), "Ministrantenplan - ");
}

TEST_F(Sichern, ZeichenAusserhalbDerCodeseiteLassenDieAlteDateiStehen)
{
    m_daten.Dateiname = pfad("plan.prd");
    Schreibe(m_daten.Dateiname, "alt");
    m_daten.Ausnahmen[0].Zeit[3] = QString::fromUtf8("10 Uhr ✝");
    m_daten.Geaendert = true;
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::Fehlgeschlagen);
    erwarteFehlermeldung();
    EXPECT_EQ(Inhalt(m_daten.Dateiname), "alt");
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"plan.prd"});
}

TEST_F(Sichern, SchreibfehlerMittendrinLaesstDieAlteDateiStehen)
{
    // A file size limit makes the write fail part-way, like a full disk, even for root.
    m_daten.Dateiname = pfad("plan.prd");
    Schreibe(m_daten.Dateiname, "alt");
    m_daten.AnzahlMinis = 2000;
    m_daten.Minis.resize(2001, m_daten.Minis[0]);
    m_daten.Geaendert = true;
    rlimit alt{};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &alt), 0);
    rlimit klein = alt;
    klein.rlim_cur = 4096;
    const auto vorherigesSignal = std::signal(SIGXFSZ, SIG_IGN);
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &klein), 0);
    const SpeicherErgebnis ergebnis = Speichern(m_daten, m_meldungen, false);
    setrlimit(RLIMIT_FSIZE, &alt);
    std::signal(SIGXFSZ, vorherigesSignal);

    EXPECT_EQ(ergebnis, SpeicherErgebnis::Fehlgeschlagen);
    erwarteFehlermeldung();
    EXPECT_EQ(Inhalt(m_daten.Dateiname), "alt");
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"plan.prd"});
}

TEST_F(Sichern, SchreibgeschuetzterOrdner)
{
    if (geteuid() == 0)
        GTEST_SKIP() << "root writes into read-only folders";
    m_daten.Dateiname = pfad("plan.prd");
    Schreibe(m_daten.Dateiname, "alt");
    ASSERT_TRUE(QFile::setPermissions(m_ordner.path(), QFileDevice::ReadOwner | QFileDevice::ExeOwner));
    m_daten.Geaendert = true;
    EXPECT_EQ(Speichern(m_daten, m_meldungen, false), SpeicherErgebnis::Fehlgeschlagen);
    QFile::setPermissions(m_ordner.path(), QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
    erwarteFehlermeldung();
    EXPECT_EQ(Inhalt(m_daten.Dateiname), "alt");
}

TEST(DatenDatei, ZaehlerDieNichtZuDenDatenPassenSindEinSchreibfehler)
{
    InitMini d = ZweiMinis();
    d.AnzahlMinis = 4;
    QByteArray b;
    QString fehler;
    EXPECT_FALSE(SchreibeDaten(d, b, &fehler));
    EXPECT_FALSE(fehler.isEmpty());
}

TEST(DatenDatei, FenstertitelInGrossbuchstaben)
{
    InitMini d;
    d.Dateiname = "/home/anna/Gemeinde St. Peter.prd";
    EXPECT_EQ(Fenstertitel(d), "Ministrantenplan - /HOME/ANNA/GEMEINDE ST. PETER.PRD");
}
