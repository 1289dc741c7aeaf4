// pradilon-cli end to end: commands, messages, files and exit codes.

#include "Programme.h"

#include "data/Cp1252.h"
#include "data/DatenDatei.h"
#include "data/InitMini.h"
#include "output/TextExport.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include <QDate>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

const QString Beispiel = QStringLiteral(PRADILON_QUELLEN "/examples/beispiel.prd");
const QString LadeFehler = QStringLiteral(
    "Fehler beim Öffnen: Dies ist keine Pradilon-Datei! Die Datei konnte nicht geöffnet werden! \n");

QByteArray Kodiert(const QStringList &zeilen)
{
    QByteArray b;
    for (const QString &z : zeilen) {
        EXPECT_TRUE(KodiereCp1252(z, b));
        b += "\r\n";
    }
    return b;
}

struct Cli : ::testing::Test {
    QTemporaryDir ordner;

    QString pfad(const char *name) const { return ordner.filePath(QString::fromUtf8(name)); }
    Lauf cli(const QStringList &argumente) const
    {
        return Starte(QStringLiteral(PRADILON_CLI), argumente, ordner.path());
    }
    // The sample parish copied into the temporary folder.
    QString beispiel() const
    {
        const QString ziel = pfad("gemeinde.prd");
        QFile::remove(ziel);
        EXPECT_TRUE(QFile::copy(Beispiel, ziel));
        QFile(ziel).setPermissions(QFile::ReadOwner | QFile::WriteOwner);
        return ziel;
    }
    QString schreibe(const char *name, const InitMini &d) const
    {
        EXPECT_TRUE(SchreibeDatei(pfad(name), d));
        return pfad(name);
    }
    InitMini lade(const QString &datei) const
    {
        InitMini d;
        EXPECT_TRUE(LeseDatei(datei, d));
        return d;
    }
    QStringList dateien() const { return QDir(ordner.path()).entryList(QDir::Files, QDir::Name); }
};

TEST_F(Cli, HelpForTheToolAndEveryCommand)
{
    for (const char *schalter : {"--help", "-h"}) {
        const Lauf l = cli({QString::fromLatin1(schalter)});
        EXPECT_EQ(l.code, 0);
        EXPECT_TRUE(l.fehler.isEmpty());
        for (const char *aufruf : {"info FILE", "save FILE OUT", "plan FILE START END [--seed N] [-o OUT]",
                                   "plan-text FILE [-o PATH]", "addresses-text FILE [-o PATH]"})
            EXPECT_TRUE(l.aus.contains(QStringLiteral("pradilon-cli ") + QString::fromLatin1(aufruf))) << aufruf;
    }
    for (const char *befehl : {"info", "save", "plan", "plan-text", "addresses-text"}) {
        const Lauf l = cli({QString::fromLatin1(befehl), QStringLiteral("x.prd"), QStringLiteral("--help")});
        EXPECT_EQ(l.code, 0) << befehl;
        EXPECT_TRUE(l.aus.startsWith(QStringLiteral("Aufruf: pradilon-cli ") + QString::fromLatin1(befehl) + u' '))
            << befehl;
        EXPECT_GT(l.aus.count(u'\n'), 2);
    }
    EXPECT_TRUE(dateien().isEmpty());
}

TEST_F(Cli, WrongUsageExits64WithTheUsage)
{
    const QString datei = beispiel();
    const QList<QStringList> faelle = {
        {},
        {"drucken", datei},
        {"info"},
        {"info", datei, datei},
        {"save", datei},
        {"plan", datei, "01.01.2027"},
        {"plan", datei, "01.01.2027", "02.01.2027", "--seed"},
        {"plan", datei, "01.01.2027", "02.01.2027", "--seed", "sieben"},
        {"plan", datei, "01.01.2027", "02.01.2027", "--seed", "-1"},
        {"plan", datei, "01.01.2027", "02.01.2027", "--tage", "3"},
        {"plan-text", datei, "-o"},
        {"addresses-text", datei, "--seed", "1"},
    };
    const QByteArray vorher = LiesDatei(datei);
    for (const QStringList &argumente : faelle) {
        const Lauf l = cli(argumente);
        EXPECT_EQ(l.code, 64) << argumente.join(u' ').toStdString();
        EXPECT_TRUE(l.fehler.contains(QStringLiteral("Aufruf: pradilon-cli "))) << l.fehler.toStdString();
        EXPECT_TRUE(l.aus.isEmpty());
    }
    EXPECT_EQ(LiesDatei(datei), vorher);
    EXPECT_EQ(dateien(), QStringList{"gemeinde.prd"});
}

TEST_F(Cli, InfoPrintsFiveLines)
{
    InitMini d;
    d.Minis.resize(4);
    d.AnzahlMinis = 3;
    d.Ausnahmen.resize(1);
    d.AnzahlAusnahmen = 1;
    d.Plan.resize(2);
    d.AnzahlPlanEintraege = 2;
    d.Intervall = 7;
    d.Geschwister = false;
    const Lauf l = cli({QStringLiteral("info"), schreibe("klein.prd", d)});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(l.aus, QStringLiteral("Minis: 3\nAusnahmen: 1\nPlaneinträge: 2\nIntervall: 7\nGeschwister: nein\n"));
    EXPECT_TRUE(l.fehler.isEmpty());
}

TEST_F(Cli, UnreadableFileExits1ForEveryCommand)
{
    ASSERT_TRUE(SchreibeBytes(pfad("kaputt.prd"), "pradilon\r\n 0 \r\n"));
    for (const char *datei : {"kaputt.prd", "fehlt.prd"}) {
        const QString p = pfad(datei);
        for (const QStringList &argumente :
             QList<QStringList>{{"info", p}, {"save", p, pfad("neu.prd")}, {"plan", p, "01.01.2027", "02.01.2027"},
                                {"plan-text", p}, {"addresses-text", p}}) {
            const Lauf l = cli(argumente);
            EXPECT_EQ(l.code, 1) << argumente.join(u' ').toStdString();
            EXPECT_EQ(l.fehler, LadeFehler);
            EXPECT_TRUE(l.aus.isEmpty());
        }
    }
    EXPECT_EQ(dateien(), QStringList{"kaputt.prd"});
}

TEST_F(Cli, SaveWritesTheSameBytesOrExits5)
{
    const QString datei = beispiel();
    Lauf l = cli({QStringLiteral("save"), datei, pfad("kopie.prd")});
    EXPECT_EQ(l.code, 0);
    EXPECT_TRUE(l.fehler.isEmpty());
    EXPECT_EQ(LiesDatei(pfad("kopie.prd")), LiesDatei(datei));

    l = cli({QStringLiteral("save"), datei, pfad("fehlt/kopie.prd")});
    EXPECT_EQ(l.code, 5);
    EXPECT_EQ(l.fehler, QStringLiteral("Fehler beim Sichern: Dateiname oder Pfadangabe ungültig! "
                                       "Datei konnte nicht gesichert werden.\n"));
}

TEST_F(Cli, PlanWithSeedIsTheCorePlanAndRepeatable)
{
    const QString datei = beispiel();
    const QByteArray vorher = LiesDatei(datei);
    const QStringList argumente = {QStringLiteral("plan"), datei, QStringLiteral("03.01.2027"),
                                   QStringLiteral("28.03.2027"), QStringLiteral("--seed"), QStringLiteral("42"),
                                   QStringLiteral("-o"), pfad("a.prd")};
    Lauf l = cli(argumente);
    ASSERT_EQ(l.code, 0) << l.fehler.toStdString();
    EXPECT_TRUE(l.fehler.isEmpty());   // 84 days: no question
    EXPECT_EQ(LiesDatei(datei), vorher);

    // The same computation in this process.
    InitMini d = lade(datei);
    StandardZufall zufall(42);
    TestMeldungen meldungen;
    TestUhr uhr;
    PlanGenerator gen(d, zufall);
    ASSERT_EQ(gen.BtnErstellen_Click(QStringLiteral("03.01.2027"), QStringLiteral("28.03.2027"), meldungen, uhr),
              PlanGenerator::Ergebnis::Fertig);
    ASSERT_TRUE(SchreibeDatei(pfad("erwartet.prd"), d));
    EXPECT_EQ(LiesDatei(pfad("a.prd")), LiesDatei(pfad("erwartet.prd")));

    EXPECT_EQ(cli(QStringList(argumente).replaceInStrings(QStringLiteral("a.prd"), QStringLiteral("b.prd"))).code, 0);
    EXPECT_EQ(LiesDatei(pfad("b.prd")), LiesDatei(pfad("a.prd")));
    EXPECT_GT(lade(pfad("a.prd")).AnzahlPlanEintraege, 40);
}

TEST_F(Cli, PlanWithoutOutputReplacesTheFileAndAnswersTheQuestion)
{
    const QString datei = beispiel();
    const Lauf l = cli({QStringLiteral("plan"), datei, QStringLiteral("01.01.2027"), QStringLiteral("31.12.2027")});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(l.fehler, QStringLiteral("Planberechnung: Sie wollen einen Plan der Dauer  364 Tage berechnen. "
                                       "Ist dies korrekt?\n"));
    const InitMini d = lade(datei);
    EXPECT_EQ(d.Plan[0].Datum, QStringLiteral("02.01.2027"));
    EXPECT_EQ(d.Plan[std::size_t(d.AnzahlPlanEintraege - 1)].Datum, QStringLiteral("29.12.2027"));
    EXPECT_EQ(dateien(), QStringList{"gemeinde.prd"});
}

TEST_F(Cli, RefusedPeriodExits2CalculationErrorExits3NothingWritten)
{
    const QString datei = beispiel();
    const QByteArray vorher = LiesDatei(datei);
    auto plan = [&](const char *start, const char *ende) {
        return cli({QStringLiteral("plan"), datei, QString::fromUtf8(start), QString::fromUtf8(ende),
                    QStringLiteral("-o"), pfad("neu.prd")});
    };
    Lauf l = plan("02.03.2027", "01.03.2027");
    EXPECT_EQ(l.code, 2);
    EXPECT_EQ(l.fehler, QStringLiteral("Fehler im Datum: Datum wurde falsch angegeben!\n"));

    l = plan("01.01.2027", "02.01.2028");
    EXPECT_EQ(l.code, 2);
    EXPECT_EQ(l.fehler, QStringLiteral("Planberechnung: Sie wollen einen Plan der Dauer  366 Tage berechnen. "
                                       "Ist dies korrekt?\n"
                                       "Zeitspanne zu groß: Planberechnung über ein Jahr macht keinen Sinn! \r\r\n"
                                       "Bitte wählen Sie die Zeitspanne kleiner!\n"));

    l = plan("1. März", "01.03.2027");
    EXPECT_EQ(l.code, 3);
    EXPECT_EQ(l.fehler, QStringLiteral("Fehler bei der Planberechnung: Fehler unbekannten Typs, möglicherweise durch "
                                       "Fehler bei der Eingabe. Bitte kontrollieren Sie Ihre Eingaben.\n"));

    EXPECT_EQ(LiesDatei(datei), vorher);
    EXPECT_EQ(dateien(), QStringList{"gemeinde.prd"});
}

TEST_F(Cli, PlanWhoseSaveFailsExits5)
{
    const Lauf l = cli({QStringLiteral("plan"), beispiel(), QStringLiteral("01.03.2027"), QStringLiteral("07.03.2027"),
                        QStringLiteral("-o"), pfad("fehlt/neu.prd")});
    EXPECT_EQ(l.code, 5);
    EXPECT_TRUE(l.fehler.startsWith(QStringLiteral("Fehler beim Sichern: ")));
}

TEST_F(Cli, PlanTextNextToTheFileOrAtTheGivenPath)
{
    const QString datei = beispiel();
    Lauf l = cli({QStringLiteral("plan-text"), datei});
    EXPECT_EQ(l.code, 4);   // the sample holds no plan
    EXPECT_EQ(l.fehler, QStringLiteral("Plan als Text speichern: Plan wird unter ") + pfad("PLAN.TXT")
                            + QStringLiteral(" gespeichert\n"));
    EXPECT_EQ(dateien(), QStringList{"gemeinde.prd"});

    ASSERT_EQ(cli({QStringLiteral("plan"), datei, QStringLiteral("01.03.2027"), QStringLiteral("31.03.2027")}).code, 0);
    l = cli({QStringLiteral("plan-text"), datei});
    EXPECT_EQ(l.code, 0);
    const QByteArray erwartet = Kodiert(PlanZeilen(lade(datei)));
    EXPECT_EQ(LiesDatei(pfad("PLAN.TXT")), erwartet);
    EXPECT_TRUE(erwartet.contains("\t\t"));

    l = cli({QStringLiteral("plan-text"), datei, QStringLiteral("-o"), pfad("plan.txt")});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(LiesDatei(pfad("plan.txt")), erwartet);

    // A relative data file name puts the text into the working folder.
    l = cli({QStringLiteral("plan-text"), QStringLiteral("gemeinde.prd")});
    EXPECT_EQ(l.fehler, QStringLiteral("Plan als Text speichern: Plan wird unter PLAN.TXT gespeichert\n"));

    l = cli({QStringLiteral("plan-text"), datei, QStringLiteral("-o"), pfad("fehlt/PLAN.TXT")});
    EXPECT_EQ(l.code, 5);
    EXPECT_TRUE(l.fehler.endsWith(QStringLiteral("Plan als Text speichern: Datei ") + pfad("fehlt/PLAN.TXT")
                                  + QStringLiteral(" konnte nicht geschrieben werden.\n")));
}

TEST_F(Cli, AddressesTextAlsoForAnEmptyRoster)
{
    const QString datei = beispiel();
    Lauf l = cli({QStringLiteral("addresses-text"), datei});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(l.fehler, QStringLiteral("Adressliste als Text speichern: Adressliste wird unter ") + pfad("ADRESS.TXT")
                            + QStringLiteral(" gespeichert\n"));
    const QDate heute = QDate::currentDate();
    EXPECT_EQ(LiesDatei(pfad("ADRESS.TXT")), Kodiert(AdressZeilen(lade(datei), heute)));

    const QString leer = schreibe("leer.prd", InitMini());
    l = cli({QStringLiteral("addresses-text"), leer, QStringLiteral("-o"), pfad("leer.txt")});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(LiesDatei(pfad("leer.txt")).count("\r\n"), 7);
}

} // namespace
