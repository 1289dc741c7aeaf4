// PLAN.TXT and ADRESS.TXT byte for byte, their target paths, confirmations and failures.

#include "output/TextExport.h"

#include "data/InitMini.h"
#include "support/TestMeldungen.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

QByteArray Lies(const QString &pfad)
{
    QFile f(pfad);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray("<fehlt>");
}

void Schreibe(const QString &pfad, const QByteArray &inhalt)
{
    QFile f(pfad);
    ASSERT_TRUE(f.open(QIODevice::WriteOnly));
    f.write(inhalt);
}

PlanEintrag Eintrag(const char *datum, const char *tag, const char *zeit, std::initializer_list<const char *> namen)
{
    PlanEintrag e;
    e.Datum = QString::fromUtf8(datum);
    e.Wochentag = QString::fromUtf8(tag);
    e.Zeit = QString::fromUtf8(zeit);
    e.MiniAnz = int16_t(namen.size() / 2);
    int k = 0;
    for (auto it = namen.begin(); it != namen.end(); it += 2, ++k) {
        e.Vorname[std::size_t(k)] = QString::fromUtf8(it[0]);
        e.Name[std::size_t(k)] = QString::fromUtf8(it[1]);
    }
    return e;
}

Mini Person(const char *name, const char *vorname, const char *strasse, const char *telefon, bool omi = false)
{
    Mini m;
    m.Name = QString::fromUtf8(name);
    m.Vorname = QString::fromUtf8(vorname);
    m.Strasse = QString::fromUtf8(strasse);
    m.Telefon = QString::fromUtf8(telefon);
    m.Ort = QStringLiteral("12345 Nirgendwo");
    m.Oberministrant = omi;
    return m;
}

struct TextExport : ::testing::Test {
    QTemporaryDir ordner;
    InitMini d;
    TestMeldungen meldungen;
    const QDate heute = QDate(2026, 12, 5);

    TextExport() { d.Dateiname = ordner.filePath(QStringLiteral("gemeinde.prd")); }
    QString plan() const { return ordner.filePath(QStringLiteral("PLAN.TXT")); }
    QString adressen() const { return ordner.filePath(QStringLiteral("ADRESS.TXT")); }
    void setzePlan(std::vector<PlanEintrag> eintraege)
    {
        d.Plan = std::move(eintraege);
        d.AnzahlPlanEintraege = int16_t(d.Plan.size());
    }
    void setzeMinis(std::vector<Mini> minis)
    {
        d.Minis = std::move(minis);
        d.AnzahlMinis = int16_t(d.Minis.size());
        d.Minis.emplace_back();
    }
};

TEST(PfadNebenDatei, FolderUpToTheLastSeparator)
{
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("/home/a/b/plan.prd"), QStringLiteral("PLAN.TXT")),
              QStringLiteral("/home/a/b/PLAN.TXT"));
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("/pradilon.prd"), QStringLiteral("ADRESS.TXT")),
              QStringLiteral("/ADRESS.TXT"));
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("plan.prd"), QStringLiteral("PLAN.TXT")), QStringLiteral("PLAN.TXT"));
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("/a/b/"), QStringLiteral("PLAN.TXT")), QStringLiteral("/a/b/PLAN.TXT"));
#ifdef Q_OS_WIN
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("C:\\A\\B\\plan.prd"), QStringLiteral("PLAN.TXT")),
              QStringLiteral("C:\\A\\B\\PLAN.TXT"));
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("\\pradilon.prd"), QStringLiteral("PLAN.TXT")), QStringLiteral("\\PLAN.TXT"));
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("C:/A\\B/c.prd"), QStringLiteral("PLAN.TXT")),
              QStringLiteral("C:/A\\B/PLAN.TXT"));
#else
    // A backslash is an ordinary character of a file name here.
    EXPECT_EQ(PfadNebenDatei(QStringLiteral("/a/b\\c.prd"), QStringLiteral("PLAN.TXT")), QStringLiteral("/a/PLAN.TXT"));
#endif
}

TEST_F(TextExport, PlanFileBytes)
{
    setzePlan({Eintrag("06.03.2027", "Samstag", "18.30", {"Jörg", "Weiß", "", ""}),
               Eintrag("07.03.2027", "Sonntag", "", {}),
               Eintrag("07.03.2027", "Sonntag", "10.00", {"Ben", "Jäger"})});
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Geschrieben);
    ASSERT_EQ(meldungen.gezeigt().size(), 1u);
    const auto &box = meldungen.gezeigt()[0];
    EXPECT_EQ(box.titel, QStringLiteral("Plan als Text speichern"));
    EXPECT_EQ(box.text, QStringLiteral("Plan wird unter ") + plan() + QStringLiteral(" gespeichert"));
    EXPECT_EQ(box.knoepfe, Knoepfe::OKAbbrechen);
    EXPECT_EQ(box.symbol, Symbol::Keins);
    EXPECT_EQ(Lies(plan()), QByteArray("Ministrantenplan vom 06.03.2027 bis 07.03.2027\r\n"
                                       "\r\n"
                                       "\r\n"
                                       "Samstag, den 06.03.2027, 18.30 Uhr\r\n"
                                       "\t\tJ\xF6rg Wei\xDF\r\n"
                                       "\t\t \r\n"
                                       "\r\n"
                                       "Sonntag, den 07.03.2027,  Uhr\r\n"
                                       "\r\n"
                                       "Sonntag, den 07.03.2027, 10.00 Uhr\r\n"
                                       "\t\tBen J\xE4ger\r\n"));
}

TEST_F(TextExport, OneEntryOfTwoGivesSixLinesAndTheViewTheSameLines)
{
    setzePlan({Eintrag("24.12.2026", "Donnerstag", "22.00", {"Anna", "Groß", "Till", "Öz"})});
    const QStringList zeilen = PlanZeilen(d);
    EXPECT_EQ(zeilen, (QStringList{"Ministrantenplan vom 24.12.2026 bis 24.12.2026", "", "",
                                   "Donnerstag, den 24.12.2026, 22.00 Uhr", "\t\tAnna Groß", "\t\tTill Öz"}));
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Geschrieben);
    EXPECT_EQ(Lies(plan()).count("\r\n"), 6);
}

TEST_F(TextExport, CancelOrNoPlanWriteNothing)
{
    Schreibe(plan(), "alt\r\n");
    setzePlan({Eintrag("06.03.2027", "Samstag", "18.30", {"A", "B"})});
    meldungen.antworte(Antwort::Abbrechen);
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Abgebrochen);
    EXPECT_EQ(Lies(plan()), QByteArray("alt\r\n"));

    d.AnzahlPlanEintraege = 0;
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::NichtsZuSchreiben);
    EXPECT_EQ(meldungen.gezeigt().size(), 2u);   // the confirmation is still asked, nothing more
    EXPECT_EQ(Lies(plan()), QByteArray("alt\r\n"));
    EXPECT_TRUE(PlanZeilen(d).isEmpty());

    meldungen.antworte(Antwort::Abbrechen);
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Abgebrochen);
    EXPECT_FALSE(QFile::exists(adressen()));
}

TEST_F(TextExport, OkReplacesAnOlderFileCompletely)
{
    Schreibe(plan(), QByteArray(5000, 'x'));
    setzePlan({Eintrag("06.03.2027", "Samstag", "18.30", {"A", "B"})});
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Geschrieben);
    EXPECT_EQ(Lies(plan()), QByteArray("Ministrantenplan vom 06.03.2027 bis 06.03.2027\r\n\r\n\r\n"
                                       "Samstag, den 06.03.2027, 18.30 Uhr\r\n\t\tA B\r\n"));
}

TEST_F(TextExport, FailureKeepsTheOldFileAndSaysSo)
{
    Schreibe(plan(), "alt\r\n");
    setzePlan({Eintrag("06.03.2027", "Samstag", "18.30", {"Zoë", "Ĳssel"})});   // no byte for Ĳ
    EXPECT_EQ(PlanAlsTextSpeichern(d, meldungen), ExportErgebnis::Fehlgeschlagen);
    EXPECT_EQ(Lies(plan()), QByteArray("alt\r\n"));
    ASSERT_EQ(meldungen.gezeigt().size(), 2u);
    const auto &box = meldungen.gezeigt()[1];
    EXPECT_EQ(box.titel, QStringLiteral("Plan als Text speichern"));
    EXPECT_EQ(box.text, QStringLiteral("Datei ") + plan() + QStringLiteral(" konnte nicht geschrieben werden."));
    EXPECT_EQ(box.knoepfe, Knoepfe::OK);
    EXPECT_EQ(box.symbol, Symbol::Kritisch);
    EXPECT_EQ(QDir(ordner.path()).entryList(QDir::Files), QStringList{"PLAN.TXT"});   // no temporary left
}

TEST_F(TextExport, MissingFolderIsReportedForBothFiles)
{
    d.Dateiname = ordner.filePath(QStringLiteral("fehlt/gemeinde.prd"));
    const QString ziel = ordner.filePath(QStringLiteral("fehlt/ADRESS.TXT"));
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Fehlgeschlagen);
    EXPECT_EQ(meldungen.texte(),
              (QStringList{QStringLiteral("Adressliste wird unter ") + ziel + QStringLiteral(" gespeichert"),
                           QStringLiteral("Datei ") + ziel + QStringLiteral(" konnte nicht geschrieben werden.")}));
    EXPECT_EQ(meldungen.titel(), (QStringList{"Adressliste als Text speichern", "Adressliste als Text speichern"}));
    EXPECT_EQ(meldungen.gezeigt()[1].symbol, Symbol::Kritisch);
    EXPECT_FALSE(QFile::exists(ziel));
}

TEST_F(TextExport, EmptyRosterGivesSevenLines)
{
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Geschrieben);
    const auto &box = meldungen.gezeigt()[0];
    EXPECT_EQ(box.titel, QStringLiteral("Adressliste als Text speichern"));
    EXPECT_EQ(box.text, QStringLiteral("Adressliste wird unter ") + adressen() + QStringLiteral(" gespeichert"));
    EXPECT_EQ(box.knoepfe, Knoepfe::OKAbbrechen);
    EXPECT_EQ(box.symbol, Symbol::Keins);
    EXPECT_EQ(Lies(adressen()), QByteArray("Adressverzeichnis aller Ministranten\t(Stand 05.12.2026)\r\n"
                                           "\r\n\r\n\r\n\r\n"
                                           "Oberministranten\r\n"
                                           "\r\n"));
}

TEST_F(TextExport, AddressLinesHeadServersLastInRosterOrder)
{
    setzeMinis({Person("Zöllner", "Jakob", "Höhenweg 24", "0815"), Person("Bäumler", "Lea", "", "1093", true),
                Person("Aigner", "Lukas", "Bergstraße 21", ""), Person("Dörfler", "Max", "Kapellenweg 2", "44", true)});
    d.Minis[2].NichtEinteilen = true;
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute), ExportErgebnis::Geschrieben);
    EXPECT_EQ(Lies(adressen()), QByteArray("Adressverzeichnis aller Ministranten\t(Stand 05.12.2026)\r\n"
                                           "\r\n\r\n"
                                           "Z\xF6llner\tJakob\tH\xF6henweg 24\t0815\r\n"
                                           "Aigner\tLukas\tBergstra\xDF" "e 21\t\r\n"
                                           "\r\n\r\n"
                                           "Oberministranten\r\n"
                                           "\r\n"
                                           "B\xE4umler\tLea\t\t1093\r\n"
                                           "D\xF6rfler\tMax\tKapellenweg 2\t44\r\n"));
}

TEST_F(TextExport, ExplicitTargetPath)
{
    const QString ziel = ordner.filePath(QStringLiteral("anders.txt"));
    setzeMinis({Person("A", "B", "C", "D")});
    EXPECT_EQ(AdresslisteAlsTextSpeichern(d, meldungen, heute, ziel), ExportErgebnis::Geschrieben);
    EXPECT_TRUE(Lies(ziel).contains("A\tB\tC\tD\r\n"));
    EXPECT_EQ(meldungen.texte()[0], QStringLiteral("Adressliste wird unter ") + ziel + QStringLiteral(" gespeichert"));
    EXPECT_FALSE(QFile::exists(adressen()));
}

TEST_F(TextExport, CountsBeyondTheStoredDataAreNotRead)
{
    setzePlan({Eintrag("06.03.2027", "Samstag", "18.30", {"A", "B"})});
    d.AnzahlPlanEintraege = 3;
    d.Plan[0].MiniAnz = 50;
    const QStringList zeilen = PlanZeilen(d);
    EXPECT_EQ(zeilen.size(), 4 + 41);
    EXPECT_EQ(zeilen[0], QStringLiteral("Ministrantenplan vom 06.03.2027 bis 06.03.2027"));
    setzeMinis({Person("A", "B", "C", "D")});
    d.AnzahlMinis = 5;
    EXPECT_EQ(AdressZeilen(d, heute).size(), 7 + 2);   // the record and the spare the storage holds
}

} // namespace
