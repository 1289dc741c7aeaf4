// The shipped sample parish: written by its generator, and usable as it is.

#include "Programme.h"

#include "data/DatenDatei.h"
#include "data/InitMini.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"

#include <QRegularExpression>
#include <QSet>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

const QString Beispiel = QStringLiteral(PRADILON_QUELLEN "/examples/beispiel.prd");

#ifdef PRADILON_BEISPIEL
TEST(Beispiel, CommittedFileIsWhatTheGeneratorWritesToday)
{
    QTemporaryDir ordner;
    const QString ziel = ordner.filePath(QStringLiteral("beispiel.prd"));
    const Lauf l = Starte(QStringLiteral(PRADILON_BEISPIEL), {ziel});
    ASSERT_EQ(l.code, 0) << l.fehler.toStdString();
    EXPECT_EQ(LiesDatei(ziel), LiesDatei(Beispiel))
        << "examples/beispiel.prd is out of date: run pradilon-beispiel examples/beispiel.prd";
}
#endif

TEST(Beispiel, IsARealisticParish)
{
    InitMini d;
    ASSERT_TRUE(LeseDatei(Beispiel, d));
    EXPECT_GE(d.AnzahlMinis, 20);
    EXPECT_LE(d.AnzahlMinis, 30);
    QSet<QString> familien;
    int geschwister = 0, oberministranten = 0, nicht = 0, wochentage = 0, spannen = 0, tage = 0;
    bool umlaute = false;
    for (int i = 0; i < d.AnzahlMinis; ++i) {
        const Mini &m = d.Minis[std::size_t(i)];
        const QString familie = m.Name + u'|' + m.Strasse;
        geschwister += familien.contains(familie);
        familien.insert(familie);
        oberministranten += m.Oberministrant;
        nicht += m.NichtEinteilen;
        wochentage += std::count(m.Ausgenommen.begin() + 1, m.Ausgenommen.end(), true) > 0;
        for (int k = 0; k < m.AnzahlTermine; ++k)
            (m.Termine[std::size_t(k)].contains(u'-') ? spannen : tage)++;
        umlaute = umlaute || (m.Name + m.Strasse).contains(QRegularExpression(QStringLiteral("[äöüß]")));
    }
    EXPECT_GE(geschwister, 3);
    EXPECT_GE(oberministranten, 2);
    EXPECT_EQ(nicht, 1);
    EXPECT_GE(wochentage, 3);
    EXPECT_GE(spannen, 3);
    EXPECT_GE(tage, 3);
    EXPECT_TRUE(umlaute);
    EXPECT_GE(d.AnzahlAusnahmen, 5);
}

TEST(Beispiel, PlansAYearWithEveryPlaceFilled)
{
    InitMini d;
    ASSERT_TRUE(LeseDatei(Beispiel, d));
    StandardZufall zufall(3);
    TestMeldungen meldungen;
    TestUhr uhr;
    PlanGenerator gen(d, zufall);
    ASSERT_EQ(gen.BtnErstellen_Click(QStringLiteral("24.12.2026"), QStringLiteral("23.12.2027"), meldungen, uhr),
              PlanGenerator::Ergebnis::Fertig);
    QString nichtEingeteilt;
    for (int i = 0; i < d.AnzahlMinis; ++i) {
        if (d.Minis[std::size_t(i)].NichtEinteilen)
            nichtEingeteilt = d.Minis[std::size_t(i)].Vorname;
    }
    QStringList ostern;
    for (int e = 0; e < d.AnzahlPlanEintraege; ++e) {
        const PlanEintrag &p = d.Plan[std::size_t(e)];
        for (int k = 0; k < p.MiniAnz; ++k) {
            EXPECT_FALSE(p.Name[std::size_t(k)].isEmpty()) << p.Datum.toStdString() << " " << p.Zeit.toStdString();
            EXPECT_NE(p.Vorname[std::size_t(k)], nichtEingeteilt);
        }
        if (p.Datum == QStringLiteral("28.03.2027"))
            ostern << p.Zeit + QStringLiteral(" ") + QString::number(p.MiniAnz);
    }
    EXPECT_EQ(ostern, (QStringList{"10.00 8", "18.00 2"}));   // the holiday page, not the Sunday services
}

} // namespace
