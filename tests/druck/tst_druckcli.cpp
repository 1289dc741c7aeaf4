#include "data/DatenDatei.h"
#include "data/InitMini.h"

#include <QDir>
#include <QFileInfo>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <gtest/gtest.h>

// "pradilon-cli print" end to end: a data file in, a PDF out, read back with poppler-utils.

namespace {

struct Lauf {
    int code = -1;
    QString fehler;
};

Lauf Starte(const QString &programm, const QStringList &argumente)
{
    QProcess p;
    QProcessEnvironment umgebung = QProcessEnvironment::systemEnvironment();
    umgebung.remove(QStringLiteral("DISPLAY"));
    umgebung.remove(QStringLiteral("WAYLAND_DISPLAY"));
    umgebung.remove(QStringLiteral("QT_QPA_PLATFORM"));
    p.setProcessEnvironment(umgebung);
    p.start(programm, argumente);
    if (!p.waitForFinished(60000))
        return {};
    return {p.exitStatus() == QProcess::NormalExit ? p.exitCode() : -1,
            QString::fromUtf8(p.readAllStandardError())};
}

QString Text(const QString &pdf, int seite = 0)
{
    QStringList argumente;
    if (seite > 0)
        argumente << "-f" << QString::number(seite) << "-l" << QString::number(seite);
    QProcess p;
    p.start("pdftotext", argumente << pdf << "-");
    p.waitForFinished(30000);
    return QString::fromUtf8(p.readAllStandardOutput());
}

QString Ausgabe(const QString &programm, const QString &pdf)
{
    QProcess p;
    p.start(programm, {pdf});
    p.waitForFinished(30000);
    return QString::fromUtf8(p.readAllStandardOutput());
}

int Seiten(const QString &pdf)
{
    const auto m = QRegularExpression("Pages:\\s+(\\d+)").match(Ausgabe("pdfinfo", pdf));
    return m.hasMatch() ? m.captured(1).toInt() : -1;
}

class DruckCliTest : public ::testing::Test
{
protected:
    void SetUp() override
    {
        ASSERT_TRUE(m_ordner.isValid());
        InitMini d;
        const QStringList namen{"Müller", "Weiß", "Öztürk", "Schmidt"};
        d.AnzahlMinis = int16_t(namen.size());
        d.Minis.resize(namen.size() + 1);
        d.Sperre.assign(namen.size() + 1, 0);
        d.Einsaetze.assign(namen.size() + 1, 0);
        for (int i = 0; i < namen.size(); ++i) {
            d.Minis[i].Name = namen[i];
            d.Minis[i].Vorname = QStringLiteral("Vorname%1").arg(i);
            d.Minis[i].Strasse = QStringLiteral("Kirchstraße %1").arg(i + 1);
        }
        d.Minis[3].Oberministrant = true;
        d.AnzahlPlanEintraege = 60;
        d.Plan.resize(61);
        for (int i = 0; i < 60; ++i) {
            PlanEintrag &e = d.Plan[i];
            e.Datum = QDate(2027, 1, 1).addDays(i).toString("dd.MM.yyyy");
            e.Wochentag = QStringLiteral("Freitag");
            e.Zeit = QStringLiteral("9.30");
            e.MiniAnz = 2;
            for (int k = 0; k < 2; ++k) {
                e.Name[k] = namen[(i + k) % namen.size()];
                e.Vorname[k] = QStringLiteral("Vorname%1").arg((i + k) % namen.size());
            }
        }
        m_datei = m_ordner.filePath("gemeinde.prd");
        ASSERT_TRUE(SchreibeDatei(m_datei, d));
    }

    Lauf drucke(const QStringList &mehr) { return Starte(PRADILON_CLI, QStringList{"print", m_datei} + mehr); }
    QString pdf(const QString &name = "PLAN.PDF") const { return m_ordner.filePath(name); }

    QTemporaryDir m_ordner;
    QString m_datei;
};

TEST_F(DruckCliTest, DefaultsPrintAddressListThenPlanIntoThePdf)
{
    const Lauf l = drucke({"--pdf", pdf()});
    ASSERT_EQ(l.code, 0) << l.fehler.toStdString();
    EXPECT_EQ(l.fehler, QString());
    const int seiten = Seiten(pdf());
    ASSERT_GE(seiten, 3);
    const QString erste = Text(pdf(), 1);
    EXPECT_TRUE(erste.contains("Adressverzeichnis aller Ministranten")) << erste.toStdString();
    EXPECT_TRUE(erste.contains("Öztürk"));
    EXPECT_TRUE(erste.contains("Kirchstraße 1"));
    EXPECT_FALSE(erste.contains("Ministrantenplan vom"));
    EXPECT_TRUE(Text(pdf(), 2).startsWith("Ministrantenplan vom 01.01.2027 bis 01.03.2027"));
    EXPECT_TRUE(Text(pdf(), seiten).contains("Freitag, den 01.03.2027, 9.30 Uhr:"));
    EXPECT_FALSE(Text(pdf(), seiten).trimmed().isEmpty());
}

TEST_F(DruckCliTest, DocumentSwitchesFontSizeAndSpacing)
{
    ASSERT_EQ(drucke({"--pdf", pdf("A.PDF"), "--no-plan"}).code, 0);
    EXPECT_EQ(Seiten(pdf("A.PDF")), 1);
    EXPECT_FALSE(Text(pdf("A.PDF")).contains("Ministrantenplan"));

    ASSERT_EQ(drucke({"--pdf", pdf("P.PDF"), "--no-addresses"}).code, 0);
    EXPECT_TRUE(Text(pdf("P.PDF"), 1).startsWith("Ministrantenplan vom"));
    EXPECT_FALSE(Text(pdf("P.PDF")).contains("Adressverzeichnis"));

    // Larger size and spacing need more pages for the same plan.
    const Lauf gross = drucke({"--pdf", pdf("G.PDF"), "--no-addresses", "--size", "14", "--spacing", "2"});
    ASSERT_EQ(gross.code, 0);
    EXPECT_EQ(gross.fehler, QString());
    EXPECT_GT(Seiten(pdf("G.PDF")), Seiten(pdf("P.PDF")));

    // At 20 points the plan's title no longer fits between the margins of A4.
    const Lauf zuGross = drucke({"--pdf", pdf("Z.PDF"), "--size", "20"});
    EXPECT_EQ(zuGross.code, 0);
    EXPECT_EQ(zuGross.fehler, QStringLiteral("Fehler beim Drucken: Plan kann nicht gedruckt werden, da die Schrift "
                                             "zu groß gewählt wurde!\n"));
    EXPECT_EQ(Seiten(pdf("Z.PDF")), 1);
    EXPECT_TRUE(Text(pdf("Z.PDF")).contains("Adressverzeichnis"));

    ASSERT_EQ(drucke({"--pdf", pdf("S.PDF"), "--font", "DejaVu Serif"}).code, 0);
    EXPECT_TRUE(Ausgabe("pdffonts", pdf("S.PDF")).contains("DejaVuSerif"));
}

TEST_F(DruckCliTest, SizeCorrectionIsReportedOnStandardError)
{
    const Lauf l = drucke({"--pdf", pdf(), "--size", "30"});
    EXPECT_EQ(l.code, 0);
    EXPECT_EQ(l.fehler, QStringLiteral("Falsche Schriftgröße: Schriftgröße nicht durchführbar! Korrigiere auf 10.\n"));
    EXPECT_TRUE(QFileInfo::exists(pdf()));
}

TEST_F(DruckCliTest, UnwritablePdfExitsFiveAndLeavesNothing)
{
    const QString fehlt = m_ordner.filePath("fehlt/PLAN.PDF");
    Lauf l = drucke({"--pdf", fehlt});
    EXPECT_EQ(l.code, 5);
    EXPECT_EQ(l.fehler, "Als PDF speichern: Datei " + fehlt + " konnte nicht geschrieben werden.\n");

    ASSERT_TRUE(QDir().mkpath(pdf("ORDNER.PDF")));
    l = drucke({"--pdf", pdf("ORDNER.PDF")});
    EXPECT_EQ(l.code, 5);
    EXPECT_TRUE(QFileInfo(pdf("ORDNER.PDF")).isDir());
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"gemeinde.prd"});
}

TEST_F(DruckCliTest, WrongCallsAndUnreadableFiles)
{
    EXPECT_EQ(drucke({}).code, 64);                                           // no --pdf
    EXPECT_EQ(drucke({"--pdf", pdf(), "--no-plan", "--no-addresses"}).code, 64);
    EXPECT_EQ(drucke({"--pdf", pdf(), "--spacing", "0"}).code, 64);
    EXPECT_EQ(drucke({"--pdf", pdf(), "--colour", "x"}).code, 64);
    EXPECT_FALSE(QFileInfo::exists(pdf()));

    const Lauf l = Starte(PRADILON_CLI, {"print", m_ordner.filePath("fehlt.prd"), "--pdf", pdf()});
    EXPECT_EQ(l.code, 1);
    EXPECT_TRUE(l.fehler.startsWith("Fehler beim Öffnen: ")) << l.fehler.toStdString();
    EXPECT_FALSE(QFileInfo::exists(pdf()));
}

} // namespace
