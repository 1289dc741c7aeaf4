#include <QDate>
#include <QDir>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <gtest/gtest.h>

// "pradilon-cli print" end to end: the real job through the Qt printer into PDF files, read back
// with poppler-utils.

namespace {

// Exit code (-1 when it did not finish) and standard output, or standard error with fehler.
// Without a display variable, as on a server: pradilon-cli must find a platform by itself.
std::pair<int, QString> Lauf(const QString &programm, const QStringList &argumente, bool fehler = false)
{
    QProcessEnvironment umgebung = QProcessEnvironment::systemEnvironment();
    for (const char *name : {"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"})
        umgebung.remove(name);
    QProcess p;
    p.setProcessEnvironment(umgebung);
    p.start(programm, argumente);
    if (!p.waitForFinished(60000))
        return {-1, {}};
    return {p.exitCode(), QString::fromUtf8(fehler ? p.readAllStandardError() : p.readAllStandardOutput())};
}

// The text of each page; none when the file cannot be read.
QStringList Seiten(const QString &pdf)
{
    QStringList seiten = Lauf("pdftotext", {"-layout", pdf, "-"}).second.split('\f');
    seiten.removeLast();
    return seiten;
}

TEST(DruckCli, PrintsThePdfAndReportsThroughExitCodes)
{
    // Meier, then the head server Müller; two services, the first with an empty second place.
    const QString datei = PRADILON_TESTDATEN "/zwei-minis-ausnahme-plan.prd";
    QTemporaryDir ordner;
    const QString pdf = ordner.filePath("PLAN.PDF"), fehlt = ordner.filePath("fehlt/PLAN.PDF"),
                  verzeichnis = ordner.filePath("ORDNER.PDF");
    ASSERT_TRUE(QDir().mkpath(verzeichnis));

    // Defaults: both documents, the plan on a page of its own, A4.
    EXPECT_EQ(Lauf(PRADILON_CLI, {"print", datei, "--pdf", pdf}, true), std::make_pair(0, QString()));
    const QStringList seiten = Seiten(pdf);
    ASSERT_EQ(seiten.size(), 2);
    EXPECT_TRUE(Lauf("pdfinfo", {pdf}).second.contains("(A4)"));
    const QString s1 = seiten[0], s2 = seiten[1];
    EXPECT_TRUE(s1.contains(QRegularExpression("^Adressverzeichnis aller Ministranten \\(Stand "
                                               + QDate::currentDate().toString("dd.MM.yyyy") + "\\)\n+"
                                               "Meier, \"Sepp\" +Anna-Lena\n+Oberministranten\n+"
                                               "Müller +Jörg +Hauptstraße 5 +0815/4711\n")))
        << s1.toStdString();
    // The first server on the heading's line.
    EXPECT_TRUE(s2.contains(QRegularExpression("^Ministrantenplan vom 22.12.2002 bis 25.12.2002\n+"
                                               "Sonntag, den 22.12.2002, 9.30 Uhr: +Jörg Müller\n")))
        << s2.toStdString();

    // Messages go to standard error as "title: text"; a trailing * accepts any rest.
    const QString fehlerDatei = "Als PDF speichern: Datei %1 konnte nicht geschrieben werden.\n";
    // Messages go to standard error as "title: text"; a trailing * accepts any rest. A written
    // PDF has one page that begins with beginn, and no empty page after it.
    struct Fall { QStringList argumente; int code; QString fehler, beginn; };
    for (const Fall &f : std::vector<Fall>{
             {{datei, "--pdf", pdf, "--no-plan", "--size", "30"}, 0,
              "Falsche Schriftgröße: Schriftgröße nicht durchführbar! Korrigiere auf 10.\n", "Adressverzeichnis"},
             {{datei, "--pdf", pdf, "--size", "16"}, 0,   // the plan no longer fits on A4
              "Fehler beim Drucken: Plan kann nicht gedruckt werden, da die Schrift zu groß gewählt wurde!\n",
              "Adressverzeichnis"},
             {{datei, "--pdf", pdf, "--no-addresses", "--font", "DejaVu Serif"}, 0, "", "Ministrantenplan vom"},
             {{datei, "--pdf", fehlt}, 5, fehlerDatei.arg(fehlt), ""},
             {{datei, "--pdf", verzeichnis}, 5, fehlerDatei.arg(verzeichnis), ""},
             {{datei}, 64, "*", ""},
             {{datei, "--pdf", pdf, "--no-plan", "--no-addresses"}, 64, "*", ""},
             {{datei, "--pdf", pdf, "--spacing", "0"}, 64, "*", ""},
             {{ordner.filePath("fehlt.prd"), "--pdf", pdf}, 1, "Fehler beim Öffnen: *", ""}}) {
        SCOPED_TRACE(f.argumente.join(' ').toStdString());
        QFile::remove(pdf);
        const auto [code, fehler] = Lauf(PRADILON_CLI, QStringList{"print"} + f.argumente, true);
        EXPECT_EQ(code, f.code);
        EXPECT_TRUE(f.fehler.endsWith('*') ? fehler.startsWith(f.fehler.chopped(1)) : fehler == f.fehler)
            << fehler.toStdString();
        EXPECT_EQ(Seiten(pdf).size(), f.code == 0 ? 1 : 0);
        EXPECT_TRUE(Seiten(pdf).value(0, "").startsWith(f.beginn));
        EXPECT_EQ(Lauf("pdffonts", {pdf}).second.contains("DejaVuSerif"), f.argumente.contains("DejaVu Serif"));
    }
    EXPECT_EQ(QDir(ordner.path()).entryList(QDir::Files | QDir::Hidden), QStringList());
}

} // namespace
