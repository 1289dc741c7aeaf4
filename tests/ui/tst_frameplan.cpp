#include "ui/FramePlan.h"

#include "data/InitMini.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"
#include "support/TestMeldungen.h"
#include "support/TestUhr.h"
#include "support_seiten.h"

#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>

#include <memory>

namespace {

// Notes the caption of the progress panel each time it is painted.
class Malprotokoll : public QObject
{
public:
    QStringList texte;

protected:
    bool eventFilter(QObject *objekt, QEvent *ereignis) override
    {
        if (ereignis->type() == QEvent::Paint)
            texte << static_cast<QLabel *>(objekt)->text();
        return false;
    }
};

} // namespace

class TestFramePlan : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<InitMini> d;
    std::unique_ptr<TestMeldungen> meldungen;
    std::unique_ptr<StandardZufall> zufall;
    std::unique_ptr<PlanGenerator> generator;
    TestUhr uhr;
    std::unique_ptr<SeitenHauptfenster> fenster;
    FramePlan *panel = nullptr;

    QLineEdit *start() { return kind<QLineEdit>(panel, QStringLiteral("TxtStartDatum")); }
    QLineEdit *ende() { return kind<QLineEdit>(panel, QStringLiteral("TxtEndDatum")); }
    QPushButton *erstellen() { return kind<QPushButton>(panel, QStringLiteral("BtnErstellen")); }
    QPushButton *abbrechen() { return kind<QPushButton>(panel, QStringLiteral("BtnAbbruch3")); }
    QLabel *anzeige() { return kind<QLabel>(panel, QStringLiteral("PanelPlanAnzeige")); }

    void alterPlan()
    {
        d->Plan.resize(2);
        d->Plan[0].Datum = QStringLiteral("01.01.2000");
        d->AnzahlPlanEintraege = 1;
    }

private slots:
    void init()
    {
        d = std::make_unique<InitMini>();
        d->Minis.resize(3);
        d->Minis[0].Name = QStringLiteral("Meier");
        d->Minis[1].Name = QStringLiteral("Müller");
        d->AnzahlMinis = 2;
        d->Sperre.assign(3, 0);
        d->Einsaetze.assign(3, 0);
        d->Regulaer[1].Zeit[0] = QStringLiteral("9.30");
        d->Regulaer[1].MiniAnz[0] = QStringLiteral("1");
        meldungen = std::make_unique<TestMeldungen>();
        zufall = std::make_unique<StandardZufall>(7);
        generator = std::make_unique<PlanGenerator>(*d, *zufall);
        fenster = std::make_unique<SeitenHauptfenster>();
        panel = new FramePlan(*d, *meldungen, *fenster, *generator, uhr);
        fenster->nimmSeite(panel);
        fenster->show();
        QVERIFY(QTest::qWaitForWindowExposed(fenster.get()));
    }
    void cleanup() { fenster.reset(); }

    void erstellenErstMitBeidenTexten()
    {
        QVERIFY(!panel->isVisible());
        panel->MnuPlanErstellen_Click();
        QVERIFY(panel->isVisible());
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QCOMPARE(anzeige()->text(), QStringLiteral("Bearbeitet: 0%"));
        QCOMPARE(fenster->focusWidget(), start());
        QVERIFY(!erstellen()->isEnabled());
        QVERIFY(abbrechen()->isEnabled());
        tippe(start(), QStringLiteral("x"));
        QVERIFY(!erstellen()->isEnabled());
        tippe(ende(), QStringLiteral("y"));
        QVERIFY(erstellen()->isEnabled());
        // Emptying a box again leaves the button enabled.
        tippe(start(), QString());
        QVERIFY(erstellen()->isEnabled());

        klicke(abbrechen());
        QVERIFY(!panel->isVisible());
        QCOMPARE(fenster->aufrufe, (QStringList{"MenueDeaktivieren", "MenueAktivieren"}));
        QVERIFY(!d->Geaendert);

        // The boxes keep their texts: with one empty the button starts disabled ...
        panel->MnuPlanErstellen_Click();
        QCOMPARE(ende()->text(), QStringLiteral("y"));
        QVERIFY(!erstellen()->isEnabled());
        tippe(start(), QStringLiteral("1.12.02"));
        QVERIFY(erstellen()->isEnabled());
        klicke(abbrechen());
        // ... and with both filled it is enabled at once.
        panel->MnuPlanErstellen_Click();
        QVERIFY(erstellen()->isEnabled());
    }

    void vollstaendigerLaufSchliesstPanel()
    {
        alterPlan();
        panel->MnuPlanErstellen_Click();
        tippe(start(), QStringLiteral("1.12.02"));
        tippe(ende(), QStringLiteral("3.12.02"));
        QTRY_VERIFY(anzeige()->isVisible());
        QCoreApplication::processEvents();
        Malprotokoll protokoll;
        anzeige()->installEventFilter(&protokoll);
        klicke(erstellen());

        QVERIFY(meldungen->gezeigt().empty());
        QVERIFY(!panel->isVisible());
        QCOMPARE(fenster->aufrufe, (QStringList{"MenueDeaktivieren", "MenueAktivieren"}));
        QVERIFY(d->Geaendert);
        QCOMPARE(d->AnzahlPlanEintraege, int16_t(1));
        QCOMPARE(d->Plan[0].Datum, QStringLiteral("01.12.2002"));
        // Painted during the computation, without the event loop: after each day but the last.
        QCOMPARE(protokoll.texte, (QStringList{"Bearbeitet:  50%", "Bearbeitet:  100%"}));

        panel->MnuPlanErstellen_Click();
        QCOMPARE(anzeige()->text(), QStringLiteral("Bearbeitet: 0%"));
    }

    void abgelehnterZeitraumLaesstPanelOffen()
    {
        alterPlan();
        panel->MnuPlanErstellen_Click();
        tippe(start(), QStringLiteral("3.12.02"));
        tippe(ende(), QStringLiteral("1.12.02"));
        klicke(erstellen());
        QCOMPARE(meldungen->texte(), QStringList{QStringLiteral("Datum wurde falsch angegeben!")});
        QCOMPARE(meldungen->titel(), QStringList{QStringLiteral("Fehler im Datum")});

        // A long period answered with "Nein".
        tippe(ende(), QStringLiteral("1.12.03"));
        meldungen->antworte(Antwort::Nein);
        klicke(erstellen());
        QCOMPARE(meldungen->titel().last(), QStringLiteral("Planberechnung"));

        QVERIFY(panel->isVisible());
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QVERIFY(!d->Geaendert);
        QCOMPARE(d->AnzahlPlanEintraege, int16_t(1));
        QCOMPARE(d->Plan[0].Datum, QStringLiteral("01.01.2000"));
        QCOMPARE(anzeige()->text(), QStringLiteral("Bearbeitet: 0%"));
    }

    void fehlgeschlagenerLaufLaesstPanelOffen()
    {
        panel->MnuPlanErstellen_Click();
        tippe(start(), QStringLiteral("kein Datum"));
        tippe(ende(), QStringLiteral("3.12.02"));
        klicke(erstellen());
        QCOMPARE(meldungen->titel(), QStringList{QStringLiteral("Fehler bei der Planberechnung")});
        QVERIFY(panel->isVisible());
        QCOMPARE(fenster->aufrufe, QStringList{QStringLiteral("MenueDeaktivieren")});
        QVERIFY(!d->Geaendert);
        QVERIFY(erstellen()->isEnabled());
        klicke(abbrechen());
        QVERIFY(!panel->isVisible());
        QCOMPARE(fenster->aufrufe.last(), QStringLiteral("MenueAktivieren"));
    }

    void panelPasstInsHauptfenster()
    {
        // The design gives the panel 377 x 213 pixels.
        QVERIFY(panel->minimumSizeHint().width() <= 377);
        QVERIFY(panel->minimumSizeHint().height() <= 213);
        panel->MnuPlanErstellen_Click();
        QCOMPARE(abgeschnitteneBeschriftungen(panel), QStringList());
    }
};

QTEST_MAIN(TestFramePlan)
#include "tst_frameplan.moc"
