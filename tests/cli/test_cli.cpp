// pradilon-cli end to end on temporary files: commands, messages, files and exit codes.

#include "data/DatenDatei.h"
#include "data/InitMini.h"
#include "output/TextExport.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

void PrintTo(const QString &text, std::ostream *os) { *os << '"' << text.toStdString() << '"'; }   // readable

namespace {

const QString Beispiel = QStringLiteral(PRADILON_QUELLEN "/examples/beispiel.prd");

struct Lauf {
    int code = -1;
    QString aus, fehler;   // standard output and error, UTF-8
};

QByteArray Lies(const QString &pfad)
{
    QFile f(pfad);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray("<fehlt>");
}

struct Cli : ::testing::Test {
    QTemporaryDir ordner;
    const QString datei = pfad("gemeinde.prd");

    Cli()   // the sample parish as gemeinde.prd
    {
        EXPECT_TRUE(QFile::copy(Beispiel, datei));
        QFile(datei).setPermissions(QFile::ReadOwner | QFile::WriteOwner);
    }
    QString pfad(const char *name) const { return ordner.filePath(QString::fromUtf8(name)); }
    QStringList dateien() const { return QDir(ordner.path()).entryList(QDir::Files, QDir::Name); }
    Lauf cli(const QStringList &argumente, const QString &programm = QStringLiteral(PRADILON_CLI)) const
    {
        QProcess p;
        p.setWorkingDirectory(ordner.path());
        p.start(programm, argumente);
        if (!p.waitForFinished(60000) || p.exitStatus() != QProcess::NormalExit)
            return {};
        return {p.exitCode(), QString::fromUtf8(p.readAllStandardOutput()),
                QString::fromUtf8(p.readAllStandardError())};
    }
    InitMini gemeinde;   // gemeinde.prd as loaded
    void lade() { ASSERT_TRUE(LeseDatei(datei, gemeinde)); }
};

TEST_F(Cli, HelpForTheToolAndEveryCommand)
{
    const Lauf hilfe = cli({"--help"});
    EXPECT_EQ(hilfe.code, 0);
    for (const char *aufruf : {"info FILE", "save FILE OUT", "plan FILE START END [--seed N] [-o OUT]",
                               "plan-text FILE [-o PATH]", "addresses-text FILE [-o PATH]"}) {
        EXPECT_TRUE(hilfe.aus.contains(QStringLiteral("pradilon-cli ") + QLatin1String(aufruf))) << aufruf;
        const Lauf l = cli({QString::fromLatin1(aufruf).section(u' ', 0, 0), "x.prd", "--help"});
        EXPECT_EQ(l.code, 0);
        EXPECT_TRUE(l.aus.startsWith("Aufruf: pradilon-cli " + QLatin1String(aufruf) + "\n\n")) << aufruf;
    }
}

TEST_F(Cli, FailuresExitWithTheirCodeAndMessageAndWriteNothing)
{
    ASSERT_TRUE(QFile::copy(QStringLiteral(PRADILON_QUELLEN "/CMakeLists.txt"), pfad("kaputt.prd")));
    const QString neu = pfad("neu.prd"), fehlt = pfad("fehlt/neu.prd");
    const QString sichern = "Fehler beim Sichern: Dateiname oder Pfadangabe ungültig! Datei konnte nicht "
                            "gesichert werden.\n";
    QList<std::tuple<QStringList, int, QString>> faelle = {
        {{"plan", datei, "02.03.2027", "01.03.2027", "-o", neu}, 2, "Fehler im Datum: Datum wurde falsch angegeben!\n"},
        {{"plan", datei, "01.01.2027", "02.01.2028", "-o", neu}, 2,
         "Planberechnung: Sie wollen einen Plan der Dauer  366 Tage berechnen. Ist dies korrekt?\nZeitspanne zu "
         "groß: Planberechnung über ein Jahr macht keinen Sinn! \r\r\nBitte wählen Sie die Zeitspanne kleiner!\n"},
        {{"plan", datei, "1. März", "01.03.2027", "-o", neu}, 3,
         "Fehler bei der Planberechnung: Fehler unbekannten Typs, möglicherweise durch Fehler bei der Eingabe. "
         "Bitte kontrollieren Sie Ihre Eingaben.\n"},
        {{"plan-text", datei}, 4, "Plan als Text speichern: Plan wird unter " + pfad("PLAN.TXT") + " gespeichert\n"},
        {{"plan", datei, "01.03.2027", "07.03.2027", "-o", fehlt}, 5, sichern},
        {{"save", datei, fehlt}, 5, sichern}};
    const QStringList plan = {"plan", datei, "01.01.2027", "02.01.2027"};
    for (const QStringList &argumente : QList<QStringList>{
             {}, {"drucken", datei}, {"info"}, {"info", datei, datei}, {"save", datei}, {"plan", datei, "01.01.2027"},
             plan + QStringList{"--seed"}, plan + QStringList{"--seed", "sieben"}, plan + QStringList{"--seed", "-1"},
             plan + QStringList{"--tage", "3"}, {"plan-text", datei, "-o"}, {"addresses-text", datei, "--seed", "1"}})
        faelle.append({argumente, 64, "Aufruf: pradilon-cli "});   // wrong usage: the usage follows the reason
    for (const QString &p : {pfad("kaputt.prd"), pfad("fehlt.prd")}) {
        for (const QStringList &argumente : QList<QStringList>{{"info", p}, {"save", p, neu}, {"plan-text", p},
                                                                {"plan", p, "01.01.2027", "02.01.2027"},
                                                                {"addresses-text", p}})
            faelle.append({argumente, 1, "Fehler beim Öffnen: Dies ist keine Pradilon-Datei! Die Datei konnte "
                                         "nicht geöffnet werden! \n"});
    }
    const QByteArray vorher = Lies(datei);
    for (const auto &[argumente, code, fehler] : faelle) {
        const Lauf l = cli(argumente);
        EXPECT_EQ(l.code, code) << argumente.join(u' ').toStdString();
        EXPECT_TRUE(code == 64 ? l.fehler.contains(fehler) : l.fehler == fehler) << l.fehler.toStdString();
        EXPECT_TRUE(l.aus.isEmpty());
    }
    EXPECT_EQ(Lies(datei), vorher);
    EXPECT_EQ(dateien(), (QStringList{"gemeinde.prd", "kaputt.prd"}));
}

TEST_F(Cli, PlanWithASeedIsTheCorePlanAndRepeatableInfoAndSave)
{
    const QStringList argumente = {"plan", datei, "03.01.2027", "28.03.2027", "--seed", "42", "-o", pfad("a.prd")};
    const Lauf l = cli(argumente);
    ASSERT_EQ(l.code, 0) << l.fehler.toStdString();
    EXPECT_TRUE(l.fehler.isEmpty());   // 84 days: no question
    EXPECT_EQ(cli(QStringList(argumente).replaceInStrings("a.prd", "b.prd")).code, 0);
    EXPECT_EQ(Lies(pfad("b.prd")), Lies(pfad("a.prd")));

    lade();
    StandardZufall zufall(42);
    TestMeldungen meldungen;
    PlanGenerator gen(gemeinde, zufall);
    ASSERT_EQ(gen.BtnErstellen_Click("03.01.2027", "28.03.2027", meldungen, TestUhr()), PlanGenerator::Ergebnis::Fertig)
        << "the sample must be plannable";
    ASSERT_TRUE(SchreibeDatei(pfad("erwartet.prd"), gemeinde));
    EXPECT_EQ(Lies(pfad("a.prd")), Lies(pfad("erwartet.prd")));
    EXPECT_EQ(cli({"info", pfad("a.prd")}).aus, QStringLiteral("Minis: 26\nAusnahmen: 12\nPlaneinträge: %1\n"
                                                                "Intervall: 2\nGeschwister: ja\n")
                                                     .arg(gemeinde.AnzahlPlanEintraege));
    EXPECT_EQ(cli({"save", pfad("a.prd"), pfad("kopie.prd")}).code, 0);
    EXPECT_EQ(Lies(pfad("kopie.prd")), Lies(pfad("a.prd")));
}

TEST_F(Cli, TextsNextToTheFileOrAtTheGivenPath)
{
    Lauf l = cli({"plan", datei, "01.01.2027", "31.12.2027"});   // without -o into the file itself
    ASSERT_EQ(l.code, 0);
    EXPECT_EQ(l.fehler, "Planberechnung: Sie wollen einen Plan der Dauer  364 Tage berechnen. Ist dies korrekt?\n");
    lade();
    TestMeldungen meldungen;
    ASSERT_EQ(PlanAlsTextSpeichern(gemeinde, meldungen, pfad("plan.txt")), ExportErgebnis::Geschrieben);
    EXPECT_TRUE(Lies(pfad("plan.txt")).startsWith("Ministrantenplan vom 02.01.2027 bis 29.12.2027\r\n"));
    EXPECT_EQ(cli({"plan-text", datei}).code, 0);
    EXPECT_EQ(Lies(pfad("PLAN.TXT")), Lies(pfad("plan.txt")));
    l = cli({"plan-text", datei, "-o", pfad("fehlt/PLAN.TXT")});
    EXPECT_EQ(l.code, 5);
    EXPECT_TRUE(l.fehler.endsWith("Datei " + pfad("fehlt/PLAN.TXT") + " konnte nicht geschrieben werden.\n"));

    l = cli({"addresses-text", datei});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(l.fehler, "Adressliste als Text speichern: Adressliste wird unter " + pfad("ADRESS.TXT")
                            + " gespeichert\n");
    ASSERT_EQ(AdresslisteAlsTextSpeichern(gemeinde, meldungen, QDate::currentDate(), pfad("adressen.txt")),
              ExportErgebnis::Geschrieben);
    EXPECT_EQ(Lies(pfad("ADRESS.TXT")), Lies(pfad("adressen.txt")));
    ASSERT_TRUE(SchreibeDatei(datei, InitMini()));   // an empty roster still gets its list
    EXPECT_EQ(cli({"addresses-text", datei, "-o", pfad("leer.txt")}).code, 0);
    EXPECT_EQ(Lies(pfad("leer.txt")).count("\r\n"), 7);
}

#ifdef PRADILON_BEISPIEL
TEST_F(Cli, SampleFileIsWhatItsGeneratorWritesToday)
{
    const Lauf l = cli({pfad("beispiel.prd")}, QStringLiteral(PRADILON_BEISPIEL));
    ASSERT_EQ(l.code, 0) << l.fehler.toStdString();
    EXPECT_EQ(Lies(pfad("beispiel.prd")), Lies(Beispiel))
        << "examples/beispiel.prd is out of date: run pradilon-beispiel examples/beispiel.prd";
}
#endif

} // namespace
