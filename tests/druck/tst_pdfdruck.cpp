#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include "data/InitMini.h"
#include "output/Druckauftrag.h"
#include "output/qt/QtDrucker.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QGuiApplication>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <gtest/gtest.h>

// The real job through the Qt printer into a PDF, read back with pdftotext and pdfinfo.

namespace {

QString Ausgabe(const QString &programm, const QStringList &argumente)
{
    QProcess p;
    p.start(programm, argumente);
    if (!p.waitForFinished(30000) || p.exitCode() != 0)
        return QStringLiteral("<%1 failed: %2>").arg(programm, QString::fromLocal8Bit(p.readAllStandardError()));
    return QString::fromUtf8(p.readAllStandardOutput());
}

int Seiten(const QString &pdf)
{
    const auto m = QRegularExpression(QStringLiteral("Pages:\\s+(\\d+)")).match(Ausgabe("pdfinfo", {pdf}));
    return m.hasMatch() ? m.captured(1).toInt() : -1;
}

QString SeitenText(const QString &pdf, int seite)
{
    const QString n = QString::number(seite);
    return Ausgabe("pdftotext", {"-layout", "-f", n, "-l", n, pdf, "-"});
}

class PdfDruckTest : public ::testing::Test
{
protected:
    void SetUp() override
    {
        ASSERT_TRUE(m_ordner.isValid());
        d.AnzahlMinis = 3;
        d.Minis.resize(4);
        d.Minis[0].Name = QStringLiteral("Müller");
        d.Minis[0].Vorname = QStringLiteral("Jörg");
        d.Minis[0].Strasse = QStringLiteral("Hauptstraße 1");
        d.Minis[0].Telefon = QStringLiteral("0761 12345");
        d.Minis[1].Name = QStringLiteral("Schmidt");
        d.Minis[1].Vorname = QStringLiteral("Anna");
        d.Minis[1].Oberministrant = true;
        d.Minis[2].Name = QStringLiteral("Weiß");
        d.Minis[2].Vorname = QStringLiteral("Bo");
        setzePlan(2, 3);
    }

    // anzahl services on consecutive days, each with plaetze servers named "Vn Nk".
    void setzePlan(int anzahl, int plaetze)
    {
        d.AnzahlPlanEintraege = int16_t(anzahl);
        d.Plan.assign(anzahl + 1, PlanEintrag());
        for (int i = 0; i < anzahl; ++i) {
            PlanEintrag &e = d.Plan[i];
            e.Datum = QDate(2027, 1, 1).addDays(i).toString(QStringLiteral("dd.MM.yyyy"));
            e.Wochentag = QStringLiteral("Freitag");
            e.Zeit = QStringLiteral("10:00");
            e.MiniAnz = int16_t(plaetze);
            for (int k = 0; k < plaetze; ++k) {
                e.Vorname[k] = QStringLiteral("V%1").arg(i);
                e.Name[k] = QStringLiteral("N%1").arg(k);
            }
        }
    }

    DruckErgebnis druckeNach(const QString &pfad)
    {
        auto drucker = QtDrucker::pdfDatei(pfad);
        EXPECT_EQ(drucker->druckerAnzahl(), 1);
        EXPECT_EQ(drucker->druckerName(0), "PDF-Datei");
        drucker->waehleDrucker(0);
        EXPECT_GT(drucker->schriftAnzahl(), 0);
        e.schriftart = QStringLiteral("DejaVu Sans");
        return Druckauftrag(*drucker, d, meldungen, uhr).fuehreAus(e);
    }

    QTemporaryDir m_ordner;
    InitMini d;
    TestMeldungen meldungen;
    TestUhr uhr;
    DruckEinstellungen e{QString(), QStringLiteral("12"), QStringLiteral("1"), true, true};
};

TEST_F(PdfDruckTest, AddressListAndPlanOnTwoPagesWithTheirText)
{
    const QString pdf = m_ordner.filePath("PLAN.PDF");
    ASSERT_EQ(druckeNach(pdf), DruckErgebnis::Gedruckt);
    EXPECT_TRUE(meldungen.gezeigt().empty());
    ASSERT_EQ(Seiten(pdf), 2);

    const QString s1 = SeitenText(pdf, 1);
    EXPECT_TRUE(s1.contains("Adressverzeichnis aller Ministranten (Stand 05.12.2026)")) << s1.toStdString();
    // Columns: one row per server, the fields in order on one line.
    EXPECT_TRUE(s1.contains(QRegularExpression("Müller\\s+Jörg\\s+Hauptstraße 1\\s+0761 12345"))) << s1.toStdString();
    EXPECT_LT(s1.indexOf("Weiß"), s1.indexOf("Oberministranten"));
    EXPECT_LT(s1.indexOf("Oberministranten"), s1.indexOf("Schmidt"));
    EXPECT_FALSE(s1.contains("Ministrantenplan vom"));

    const QString s2 = SeitenText(pdf, 2);
    EXPECT_TRUE(s2.contains("Ministrantenplan vom 01.01.2027 bis 02.01.2027")) << s2.toStdString();
    // The first server on the heading's line.
    EXPECT_TRUE(s2.contains(QRegularExpression("Freitag, den 01.01.2027, 10:00 Uhr:\\s+V0 N0\\n"))) << s2.toStdString();
    EXPECT_TRUE(s2.contains(QRegularExpression("\\n\\s+V1 N2\\s*\\n"))) << s2.toStdString();
    EXPECT_FALSE(QFileInfo::exists(pdf + QStringLiteral(".tmp")));
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files), QStringList{"PLAN.PDF"});
}

TEST_F(PdfDruckTest, LongPlanFillsPagesWithoutAnEmptyLastPage)
{
    e.adressliste = false;
    setzePlan(40, 4);
    const QString pdf = m_ordner.filePath("LANG.PDF");
    ASSERT_EQ(druckeNach(pdf), DruckErgebnis::Gedruckt);
    const int seiten = Seiten(pdf);
    ASSERT_GE(seiten, 3);

    QString alles;
    for (int s = 1; s <= seiten; ++s) {
        const QString t = SeitenText(pdf, s);
        EXPECT_FALSE(t.trimmed().isEmpty()) << "page " << s;
        // Every service stays whole on one page.
        for (int i = 0; i < 40; ++i) {
            if (t.contains(QStringLiteral("V%1 N0\n").arg(i))) {
                EXPECT_TRUE(t.contains(QStringLiteral("V%1 N3").arg(i))) << "service " << i;
            }
        }
        alles += t;
    }
    EXPECT_EQ(alles.count("Ministrantenplan vom"), 1);
    int letzte = -1;
    for (int i = 0; i < 40; ++i) {
        const int hier = alles.indexOf(QDate(2027, 1, 1).addDays(i).toString("dd.MM.yyyy") + ", 10:00 Uhr:");
        EXPECT_GT(hier, letzte) << i;
        letzte = hier;
    }
}

TEST_F(PdfDruckTest, AddressListWithoutAPlanLeavesNoEmptyPage)
{
    setzePlan(0, 0);
    const QString pdf = m_ordner.filePath("ADR.PDF");
    ASSERT_EQ(druckeNach(pdf), DruckErgebnis::Gedruckt);
    EXPECT_EQ(Seiten(pdf), 1);
}

TEST_F(PdfDruckTest, UnwritableFileIsReportedAndLeavesTheOldFile)
{
    // A folder that does not exist.
    const QString fehlt = m_ordner.filePath("fehlt/PLAN.PDF");
    EXPECT_EQ(druckeNach(fehlt), DruckErgebnis::DateiNichtGeschrieben);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    EXPECT_EQ(meldungen.gezeigt()[0].text, "Datei " + fehlt + " konnte nicht geschrieben werden.");
    EXPECT_EQ(meldungen.gezeigt()[0].titel, "Als PDF speichern");
    EXPECT_FALSE(QFileInfo::exists(fehlt));

    // A path that is a folder: nothing is replaced and no temporary file stays behind.
    meldungen.leeren();
    const QString ordner = m_ordner.filePath("PLAN.PDF");
    ASSERT_TRUE(QDir().mkpath(ordner));
    EXPECT_EQ(druckeNach(ordner), DruckErgebnis::DateiNichtGeschrieben);
    EXPECT_TRUE(QFileInfo(ordner).isDir());
    EXPECT_EQ(QDir(m_ordner.path()).entryList(QDir::Files | QDir::Hidden), QStringList());
}

TEST_F(PdfDruckTest, MeasuresInDevicePixelsOfAnA4Page)
{
    auto drucker = QtDrucker::pdfDatei(m_ordner.filePath("X.PDF"));
    EXPECT_THROW(drucker->waehleDrucker(1), DruckerFehler);
    drucker->waehleDrucker(0);
    // A4 less 5 mm on each side at 1200 dpi (Qt rounds the margins to points).
    EXPECT_NEAR(drucker->seitenBreite(), 200 / 25.4 * 1200, 10);
    EXPECT_NEAR(drucker->seitenHoehe(), 287 / 25.4 * 1200, 10);
    drucker->setzeSchriftName("DejaVu Sans");
    drucker->setzeSchriftGroesse(12);
    const double zeile = drucker->textHoehe(QString());
    EXPECT_NEAR(zeile, 12.0 / 72 * 1200 * 1.16, 12.0 / 72 * 1200 * 0.1);   // about 1.16 em
    const double schmal = drucker->textBreite("Anna");
    drucker->setzeFett(true);
    EXPECT_GT(drucker->textBreite("Anna"), schmal);
    drucker->setzeY(100);
    drucker->druckeZeile(QString());
    EXPECT_EQ(drucker->x(), 0);
    EXPECT_DOUBLE_EQ(drucker->y(), 100 + zeile);
    drucker->setzeX(50);
    drucker->drucke("Anna");
    EXPECT_DOUBLE_EQ(drucker->x(), 50 + drucker->textBreite("Anna"));
    EXPECT_EQ(drucker->seitenAnzahl(), 1);
    drucker->neueSeite();
    drucker->druckeZeile(QString());
    EXPECT_EQ(drucker->seitenAnzahl(), 1);                 // empty text opens no page
    drucker->drucke("Bo");
    EXPECT_EQ(drucker->seitenAnzahl(), 2);
}

} // namespace

// Fonts need a QGuiApplication for the whole run.
int main(int argc, char **argv)
{
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
