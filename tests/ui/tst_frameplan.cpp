#include "ui/FramePlan.h"

#include "support_seiten.h"

#include <QLabel>

class TestFramePlan : public Seitentest
{
    Q_OBJECT

    bool erstellbar() { return kind(seite, "BtnErstellen")->isEnabled(); }
    void zeitraum(const QString &start, const QString &ende)
    {
        tipp(QStringLiteral("TxtStartDatum"), start);
        tipp(QStringLiteral("TxtEndDatum"), ende);
    }

private slots:
    void init()
    {
        starte(QStringLiteral("FramePlan"));
        d().Plan.resize(2);
        d().Plan[0].Datum = QStringLiteral("01.01.2000");
        d().AnzahlPlanEintraege = 1;
        static_cast<FramePlan *>(seite)->MnuPlanErstellen_Click();
    }

    // The complete run is part of the end-to-end test.
    void erstellenErstMitBeidenTextenAblehnungLaesstOffen()
    {
        QVERIFY(seite->isVisible() && !erstellbar() && !menueAn());
        zeitraum("x", QString());
        QVERIFY(!erstellbar());
        zeitraum("x", "y");
        QVERIFY(erstellbar());
        // Emptying a box again leaves the button enabled; only opening the panel checks afresh.
        zeitraum(QString(), "y");
        QVERIFY(erstellbar());
        klick("BtnAbbruch3");
        QVERIFY(!seite->isVisible() && !d().Geaendert && menueAn());
        static_cast<FramePlan *>(seite)->MnuPlanErstellen_Click();
        QVERIFY(!erstellbar());
        tipp("TxtStartDatum", "1.12.02");
        klick("BtnAbbruch3");
        static_cast<FramePlan *>(seite)->MnuPlanErstellen_Click();
        QVERIFY(erstellbar());

        // Start, end, whether the question is answered "Nein", the start of the one message box.
        const char *faelle[][4] = {{"3.12.02", "1.12.02", "", "Fehler im Datum: Datum wurde falsch angegeben!"},
                                   {"1.12.02", "1.12.03", "Nein", "Planberechnung: "},
                                   {"kein Datum", "3.12.02", "", "Fehler bei der Planberechnung: "}};
        for (const auto &fall : faelle) {
            zeitraum(fall[0], fall[1]);
            if (*fall[2])
                t->meldungen.antworte(Antwort::Nein);
            klick("BtnErstellen");
            QCOMPARE(meldungen().join(u'|').left(qstrlen(fall[3])), fall[3]);
            QCOMPARE(t->meldungen.gezeigt().size(), size_t(1));
            QVERIFY(seite->isVisible() && erstellbar() && !d().Geaendert && !menueAn());
            QCOMPARE(d().Plan[0].Datum + ' ' + kind<QLabel>(seite, "PanelPlanAnzeige")->text(),
                     "01.01.2000 Bearbeitet: 0%");
            t->meldungen.leeren();
        }
    }
};

QTEST_MAIN(TestFramePlan)
#include "tst_frameplan.moc"
