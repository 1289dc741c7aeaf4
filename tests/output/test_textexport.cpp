// PLAN.TXT and ADRESS.TXT byte for byte, their target paths, confirmations and failures.

#include "output/TextExport.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

void PrintTo(const QString &text, std::ostream *os) { *os << '"' << text.toStdString() << '"'; }   // readable

namespace {

QByteArray Lies(const QString &pfad)
{
    QFile f(pfad);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray("<fehlt>");
}

// Boxes as "title: text [buttons icon]": OK = 0, OKAbbrechen = 1; no icon = 0, critical = 1.
struct TextExport : ::testing::Test {
    QTemporaryDir ordner;
    InitMini d;
    TestMeldungen meldungen;
    const QDate heute{2026, 12, 5};
    const QString plan = ordner.filePath(QStringLiteral("PLAN.TXT"));
    const QString adressen = ordner.filePath(QStringLiteral("ADRESS.TXT"));

    TextExport()   // with an old, longer PLAN.TXT
    {
        d.Dateiname = ordner.filePath(QStringLiteral("gemeinde.prd"));
        QFile f(plan);
        EXPECT_TRUE(f.open(QIODevice::WriteOnly) && f.write(QByteArray(5000, 'x')) == 5000);
    }
    void setzePlan(const std::vector<std::vector<const char *>> &eintraege)   // date, weekday, time, names
    {
        for (const auto &e : eintraege) {
            PlanEintrag &p = d.Plan.emplace_back();
            p.Datum = e[0];
            p.Wochentag = e[1];
            p.Zeit = e[2];
            p.MiniAnz = int16_t((e.size() - 3) / 2);
            for (int k = 0; k < p.MiniAnz; ++k) {
                p.Vorname[k] = QString::fromUtf8(e[std::size_t(3 + 2 * k)]);
                p.Name[k] = QString::fromUtf8(e[std::size_t(4 + 2 * k)]);
            }
        }
        d.AnzahlPlanEintraege = int16_t(d.Plan.size());
    }
    QStringList boxen() const
    {
        QStringList l;
        for (const auto &b : meldungen.gezeigt())
            l << QStringLiteral("%1: %2 [%3 %4]").arg(b.titel, b.text).arg(int(b.knoepfe)).arg(int(b.symbol));
        return l;
    }
};

TEST_F(TextExport, PlanReplacesTheOldFileNextToTheDataFileWithSingleByteUmlautsAndCrLf)
{
    EXPECT_EQ(PfadNebenDatei("/pradilon.prd", "PLAN.TXT"), "/PLAN.TXT");
#ifdef Q_OS_WIN
    EXPECT_EQ(PfadNebenDatei("C:/A\\B\\c.prd", "PLAN.TXT"), "C:/A\\B\\PLAN.TXT");
#else
    EXPECT_EQ(PfadNebenDatei("/a/b\\c.prd", "PLAN.TXT"), "/a/PLAN.TXT");   // a backslash belongs to the name here
#endif
    setzePlan({{"06.03.2027", "Samstag", "18.30", "Jörg", "Weiß", "", ""}, {"07.03.2027", "Sonntag", ""},
               {"07.03.2027", "Sonntag", "10.00", "Ben", "Jäger"}});
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Geschrieben);
    EXPECT_EQ(boxen(), QStringList{"Plan als Text speichern: Plan wird unter " + plan + " gespeichert [1 0]"});
    EXPECT_EQ(Lies(plan), QByteArray("Ministrantenplan vom 06.03.2027 bis 07.03.2027\r\n\r\n\r\n"
                                     "Samstag, den 06.03.2027, 18.30 Uhr\r\n\t\tJ\xF6rg Wei\xDF\r\n\t\t \r\n\r\n"
                                     "Sonntag, den 07.03.2027,  Uhr\r\n\r\n"
                                     "Sonntag, den 07.03.2027, 10.00 Uhr\r\n\t\tBen J\xE4ger\r\n"));
}

TEST_F(TextExport, AddressListHeadServersLastEmptyRosterSevenLines)
{
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Geschrieben);
    EXPECT_EQ(boxen(), QStringList{"Adressliste als Text speichern: Adressliste wird unter " + adressen
                                   + " gespeichert [1 0]"});
    EXPECT_EQ(Lies(adressen), QByteArray("Adressverzeichnis aller Ministranten\t(Stand 05.12.2026)\r\n"
                                         "\r\n\r\n\r\n\r\nOberministranten\r\n\r\n"));

    const char *personen[][4] = {{"Zöllner", "Jakob", "Höhenweg 24", "0815"}, {"Bäumler", "Lea", "", "1093"},
                                 {"Aigner", "Lukas", "Bergstraße 21", ""}, {"Dörfler", "Max", "Kapellenweg 2", "44"}};
    d.Minis.resize(5);   // with the spare top element
    d.AnzahlMinis = 4;
    for (int i = 0; i < 4; ++i) {
        Mini &m = d.Minis[std::size_t(i)];
        m.Name = QString::fromUtf8(personen[i][0]);
        m.Vorname = QString::fromUtf8(personen[i][1]);
        m.Strasse = QString::fromUtf8(personen[i][2]);
        m.Telefon = QString::fromUtf8(personen[i][3]);
        m.Oberministrant = i % 2;
        m.NichtEinteilen = i == 2;
    }
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Geschrieben);
    EXPECT_EQ(Lies(adressen), QByteArray("Adressverzeichnis aller Ministranten\t(Stand 05.12.2026)\r\n\r\n\r\n"
                                         "Z\xF6llner\tJakob\tH\xF6henweg 24\t0815\r\n"
                                         "Aigner\tLukas\tBergstra\xDF" "e 21\t\r\n\r\n\r\nOberministranten\r\n\r\n"
                                         "B\xE4umler\tLea\t\t1093\r\nD\xF6rfler\tMax\tKapellenweg 2\t44\r\n"));
}

TEST_F(TextExport, CancelNoPlanOrAFailureKeepTheOldFileAndAFailureIsReported)
{
    setzePlan({{"06.03.2027", "Samstag", "18.30", "Zoë", "Ĳssel"}});   // no byte for Ĳ
    meldungen.antworte(Antwort::Abbrechen);
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Abgebrochen);
    meldungen.antworte(Antwort::Abbrechen);
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Abgebrochen);
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Fehlgeschlagen);
    d.AnzahlPlanEintraege = 0;
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::NichtsZuSchreiben);
    EXPECT_EQ(Lies(plan), QByteArray(5000, 'x'));
    EXPECT_EQ(QDir(ordner.path()).entryList(QDir::Files), QStringList{"PLAN.TXT"});   // no temporary either

    d.Dateiname = ordner.filePath(QStringLiteral("fehlt/gemeinde.prd"));
    const QString ziel = ordner.filePath(QStringLiteral("fehlt/ADRESS.TXT"));
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Fehlgeschlagen);
    ASSERT_EQ(boxen().size(), 7);   // each command asks once
    EXPECT_EQ(boxen()[3], "Plan als Text speichern: Datei " + plan + " konnte nicht geschrieben werden. [0 1]");
    EXPECT_EQ(boxen()[6], "Adressliste als Text speichern: Datei " + ziel + " konnte nicht geschrieben werden. [0 1]");
}

TEST_F(TextExport, CountsBeyondTheStoredDataAreNotRead)
{
    setzePlan({{"06.03.2027", "Samstag", "18.30", "A", "B"}});
    d.AnzahlPlanEintraege = 3;
    d.Plan[0].MiniAnz = 50;
    EXPECT_EQ(PlanZeilen(d).size(), 4 + 41);
    d.Minis.resize(2);
    d.AnzahlMinis = 5;
    EXPECT_EQ(AdressZeilen(d, heute).size(), 7 + 2);   // the records the storage holds
}

} // namespace
