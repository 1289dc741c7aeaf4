// The main window and what it opens directly: menus, toolbar, clock, editing state, shortcuts,
// secondary windows, the settings dialog, the info window, help and the message boxes.
#include "support_umgebung.h"

#include "ui/FormEinstellungen.h"
#include "ui/FormFileBrw.h"
#include "ui/FormInfo.h"
#include "ui/QtMeldungen.h"

#include <QCheckBox>
#include <QLabel>
#include <QMenuBar>
#include <QMessageBox>
#include <QPointer>
#include <QTimer>

namespace {

FormEinstellungen *Oeffne(FormMinis &f)
{
    f.Einstellungen();
    QApplication::setActiveWindow(OffenesFenster<FormEinstellungen>());
    return OffenesFenster<FormEinstellungen>();
}

QLineEdit *Text(QWidget *e) { return e->findChild<QLineEdit *>("TxtIntervall"); }
void Klicke(QWidget *e, const char *name) { QTest::mouseClick(e->findChild<QAbstractButton *>(name), Qt::LeftButton); }
void Tippe(QWidget *e, const QString &eingabe) { Text(e)->setFocus(Qt::TabFocusReason), Text(e)->setText(eingabe); }

} // namespace

class TestFormMinis : public QObject
{
    Q_OBJECT
private slots:
    void cleanup() { Aufraeumen(); }
    void startzustand();
    void bearbeitungszustandUndZurueck();
    void tastenUndHilfe();
    void sekundaerfensterSperrenBisZumSchliessen();
    void infoUndHilfefenster();
    void meldungenMitDeutschenKnoepfen();
    void einstellungen();
};

// Menus with captions ("~": starts disabled), toolbar images (only Up reacts), title and clock.
void TestFormMinis::startzustand()
{
    Testumgebung t;
    t.uhr.setze(QDateTime(QDate(2027, 3, 4), QTime(5, 6, 7)));
    auto f = NeuesHauptfenster(t);
    const QStringList baum = {"&Datei: Datei &öffnen ... | ~&Speichern | ~Speichern &unter ... | - | "
                              "~A&dressliste als Text speichern | ~&Plan als Text speichern | - | ~&Drucken ... | "
                              "~Als &PDF speichern ... | - | Programm &beenden",
                              "&Bearbeiten: &Liste ... | &Termine ...", "~An&sicht: Plan &anzeigen",
                              "~&Ausführen: &Plan erstellen ...", "&Optionen: Einstellungen ...",
                              "&Hilfe: I&nhalt - F1 | Hilfe &zur Hilfe | - | &Info"};
    QStringList ist;
    for (QAction *m : f->menuBar()->actions()) {
        QStringList eintraege;
        for (QAction *a : m->menu()->actions())
            eintraege << (a->isSeparator() ? "-" : (a->isEnabled() ? "" : "~") + a->text());
        ist << (m->isEnabled() ? "" : "~") + m->text() + ": " + eintraege.join(" | ");
    }
    QCOMPARE(ist, baum);
    QCOMPARE(Zustand(*f), ZustandStart);

    for (const char *bild : {"ImSaveDis", "ImPrintDis", "ImNewDis", "ImOpenUp", "ImOpenDown"})
        QTest::mouseClick(f->findChild<QWidget *>(bild), Qt::LeftButton);
    const auto fenster = QApplication::topLevelWidgets();   // the main window and one browser
    QVERIFY(std::count_if(fenster.begin(), fenster.end(), [](QWidget *w) { return w->isVisible(); }) == 2);
    QVERIFY(OffenesFenster<FormFileBrw>() && t.meldungen.gezeigt().empty());

    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + f->Daten().Dateiname.toUpper());
    auto *uhr = f->findChild<QLabel *>("PanelDatum");
    QCOMPARE(uhr->text(), QString("04.03.2027 05:06:07"));
    t.uhr.setze(QDateTime(QDate(2027, 12, 31), QTime(23, 59, 58)));
    QTRY_COMPARE_WITH_TIMEOUT(uhr->text(), QString("31.12.2027 23:59:58"), 3000);
}

void TestFormMinis::bearbeitungszustandUndZurueck()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});   // "Plan erstellen" needs servers
    f->MenueAktivieren();
    for (const QString seite : {"Liste:FrameMinis:BtnAbbruch", "Termine:FrameGodi:BtnAbbruch2",
                                "PlanErstellen:FramePlan:BtnAbbruch3"}) {
        auto *rahmen = f->findChild<QWidget *>(seite.section(':', 1, 1));
        QVERIFY(Waehle(*f, "Mnu" + seite.section(':', 0, 0)) && rahmen->isVisible());
        QCOMPARE(Zustand(*f), ZustandBearbeitung);
        QTest::mouseClick(f->findChild<QPushButton *>(seite.section(':', 2)), Qt::LeftButton);
        QVERIFY(!rahmen->isVisible());
        QCOMPARE(Zustand(*f), ZustandMitMinis);
    }
    f->Daten().AnzahlPlanEintraege = 1;
    f->MenueAktivieren();
    QCOMPARE(Zustand(*f), ZustandMitPlan);
    // MenueAktivieren only enables; through the editing state the groups follow their conditions.
    f->Daten().AnzahlMinis = f->Daten().AnzahlPlanEintraege = 0;
    f->MenueAktivieren();
    QCOMPARE(Zustand(*f), ZustandMitPlan);
    f->MenueDeaktivieren();
    f->MenueAktivieren();
    QCOMPARE(Zustand(*f), ZustandStart);
}

// Strg+S, Strg+O and Strg+Q act only while their item is reachable. Help is reachable by menu,
// toolbar and F1 always, also in the editing state and from a secondary window.
void TestFormMinis::tastenUndHilfe()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Dateiname = t.pfad("kurz.prd");
    f->Daten().Geaendert = true;
    QTest::keyClick(f.get(), Qt::Key_S, Qt::ControlModifier);
    f->MenueDeaktivieren();
    QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
    QTest::keyClick(f.get(), Qt::Key_Q, Qt::ControlModifier);
    QVERIFY(!QFile::exists(t.pfad("kurz.prd")) && !OffenesFenster<FormFileBrw>() && t.meldungen.gezeigt().empty());
    QVERIFY(Waehle(*f, "MnuInhalt") && Waehle(*f, "MnuHilfeZurHilfe"));
    QTest::mouseClick(f->findChild<QWidget *>("ImHelpUp"), Qt::LeftButton);
    QTest::keyClick(f.get(), Qt::Key_F1);
    f->MenueAktivieren();
    QTest::keyClick(f.get(), Qt::Key_S, Qt::ControlModifier);
    t.meldungen.antworte(Antwort::Nein);
    QTest::keyClick(f.get(), Qt::Key_Q, Qt::ControlModifier);
    QCOMPARE(t.meldungen.texte(), QStringList{"Soll das Programm beendet werden?"});
    QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
    QTest::keyClick(OffenesFenster<FormFileBrw>(), Qt::Key_F1);
    QVERIFY(QFile::exists(t.pfad("kurz.prd")) && t.hilfe.inhalt == 4 && t.hilfe.hilfeZurHilfe == 1);
}

// A secondary window disables the main window (close box included) but stays usable; every way of
// closing it enables the main window, restores menus (also disabled ones) and image, and deletes it.
void TestFormMinis::sekundaerfensterSperrenBisZumSchliessen()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    SchreibeBeispiel(t.pfad("plan.prd"), Beispieldaten({"Abel"}, 2));
    for (const QString fenster : {"Einstellungen:Search:BtnAbbruchEinstellungen", "Info:Help:CmdOK",
                                  "PlanAnzeigen:New:BtnOK"}) {
        const QString knopf = fenster.section(':', 1, 1);
        if (knopf == "New")
            f->Daten().Dateiname = t.pfad("plan.prd");
        QVERIFY(knopf != "New" || f->Laden());
        for (int weg = 0; weg < 3; ++weg) {
            const QString vorher = Zustand(*f);
            QVERIFY(Waehle(*f, "Mnu" + fenster.section(':', 0, 0)));
            QPointer<QWidget> w;
            for (QWidget *k : QApplication::topLevelWidgets())
                w = k != f.get() && k->isVisible() ? k : w.data();
            QVERIFY(w && w->isEnabled() && !w->parentWidget() && !f->isEnabled());
            QCOMPARE(SichtbaresBild(*f, knopf), QString(knopf == "Help" ? "Up" : "Down"));
            QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
            QVERIFY(!f->close() && !OffenesFenster<FormFileBrw>() && t.meldungen.gezeigt().empty());
            if (weg == 0)
                QTest::mouseClick(w->findChild<QPushButton *>(fenster.section(':', 2)), Qt::LeftButton);
            else
                weg == 1 ? QTest::keyClick(w, Qt::Key_Escape) : void(w->close());
            QCOMPARE(Zustand(*f), vorher);
            Aufraeumen();
            QVERIFY(w.isNull() && f->isEnabled());
        }
    }
}

// The info window at start names the help file and shows the main window; the help's own window.
void TestFormMinis::infoUndHilfefenster()
{
    Testumgebung t;
    FormMinis haupt(t.umgebung());
    auto *info = new FormInfo(haupt, t.hilfe, t.ordner.path() + "/");
    QVERIFY(t.hilfe.datei() == t.ordner.path() + "/pradilon.hlp" && haupt.isVisible() && haupt.isEnabled());
    info->show();
    // Closed while the settings are open, it leaves the main window to them.
    haupt.Einstellungen();
    QTest::mouseClick(info->findChild<QPushButton *>("CmdOK"), Qt::LeftButton);
    QVERIFY(!info->isVisible() && !haupt.isEnabled());
    OffenesFenster<FormEinstellungen>()->close();
    QVERIFY(haupt.isEnabled());

    HilfeFenster hilfe;
    hilfe.setzeDatei(PRADILON_QUELLEN "/help/pradilon.hlp");
    hilfe.ZeigeHilfeZurHilfe();
    QVERIFY(hilfe.fenster()->isVisible() && !hilfe.fenster()->parentWidget());
    QCOMPARE(hilfe.browser()->source().fragment(), QString("hilfe-zur-hilfe"));
    hilfe.ZeigeInhalt();
    QCOMPARE(hilfe.browser()->source().fragment(), QString("inhalt"));
}

// The real box. Per row: buttons, icon, button pressed ("": Escape), buttons seen, Qt's icon, answer.
void TestFormMinis::meldungenMitDeutschenKnoepfen()
{
    const QList<std::tuple<Knoepfe, Symbol, QString, QString, QMessageBox::Icon, Antwort>> faelle = {
        {Knoepfe::OK, Symbol::Kritisch, "OK", "OK", QMessageBox::Critical, Antwort::OK},
        {Knoepfe::OKAbbrechen, Symbol::Ausrufezeichen, "", "Abbrechen OK", QMessageBox::Warning, Antwort::Abbrechen},
        {Knoepfe::JaNeinAbbrechen, Symbol::Keins, "Nein", "Abbrechen Ja Nein", QMessageBox::NoIcon, Antwort::Nein},
        {Knoepfe::JaNein, Symbol::Information, "Ja", "Ja Nein", QMessageBox::Information, Antwort::Ja}};
    for (const auto &[knoepfe, symbol, druecke, gesehen, qtSymbol, antwort] : faelle) {
        QStringList ist;
        QTimer::singleShot(0, [&ist, taste = druecke] {
            auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
            for (QAbstractButton *b : box->buttons())
                ist << b->text();
            ist.sort();
            ist << box->windowTitle() + "|" + box->text() + "|" + QString::number(box->icon());
            for (QAbstractButton *b : box->buttons())
                if (b->text() == taste)
                    return b->click();
            QTest::keyClick(box, Qt::Key_Escape);
        });
        QCOMPARE(QtMeldungen().zeige("Text", knoepfe, symbol, "Titel"), antwort);
        QCOMPARE(ist, gesehen.split(' ') << "Titel|Text|" + QString::number(qtSymbol));
    }
}

// Arrows stop at 0 and 10, move values outside only towards the range. Typed values are checked on OK
// or leaving the box: outside 0..10 (also beyond 16 bits) the message and 2 (-1 below), else rounded,
// a leading number counts. OK marks the data changed even unchanged; Abbrechen and Escape keep it.
void TestFormMinis::einstellungen()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten().Intervall = 7;
    f->Daten().Geschwister = false;
    auto *e = Oeffne(*f);
    QVERIFY(!e->findChild<QCheckBox *>("CheckGeschwister")->isChecked() && Text(e)->text() == "7");
    const QList<std::tuple<QString, const char *, QString>> pfeile = {
        {"2", "Hoch", "3"}, {"2", "Runter", "1"}, {"10", "Hoch", "10"}, {"0", "Runter", "0"}, {"15", "Hoch", "15"},
        {"15", "Runter", "14"}, {"-3", "Runter", "-3"}, {"-3", "Hoch", "-2"}, {"6", "Hoch", "7"}};
    for (const auto &[start, pfeil, ergebnis] : pfeile) {
        Text(e)->setText(start);
        Klicke(e, QByteArray("SpinBtnIntervall") + pfeil);
        QCOMPARE(Text(e)->text(), ergebnis);
    }
    Klicke(e, "BtnOKEinstellungen");
    QVERIFY(f->Daten().Geaendert && !f->Daten().Geschwister && f->Daten().Intervall == 7);

    const QString warnung = "Den Abstand zwischen zwei Einteilungen >10 oder <0 zu wählen, macht keinen Sinn. "
                            "Korrigiere auf Default-Wert 2.";
    const QList<QPair<QString, int>> faelle = {{"11", -1}, {"-1", -1}, {"10.6", -1}, {"99999", -1}, {"-40000", -1},
                                               {"1E300", -1}, {"10", 10}, {"0", 0}, {"3.7", 4}, {"2.5", 2},
                                               {"abc", 0}, {"", 0}, {"6 Gottesdienste", 6}};
    for (const auto &[eingabe, wert] : faelle) {
        for (bool perTab : {false, true}) {
            t.meldungen.leeren();
            e = Oeffne(*f);
            Tippe(e, eingabe);
            if (perTab)
                QTest::keyClick(Text(e), Qt::Key_Tab);
            QCOMPARE(Text(e)->text(), perTab ? QString::number(wert < 0 ? 2 : wert) : eingabe);
            Klicke(e, "BtnOKEinstellungen");
            QCOMPARE(f->Daten().Intervall, int16_t(wert < 0 ? 2 : wert));
            QCOMPARE(t.meldungen.titel() + t.meldungen.texte(),
                     (wert < 0 ? QStringList{"Intervall zu groß", warnung} : QStringList()));
        }
    }

    for (const char *weg : {"BtnAbbruchEinstellungen", "Escape", "BtnOKEinstellungen"}) {
        f->Daten().Geaendert = false;
        t.meldungen.leeren();
        e = Oeffne(*f);
        Klicke(e, "CheckGeschwister");
        Tippe(e, "11");
        const bool ok = weg[3] == 'O', escape = weg[0] == 'E';
        escape ? QTest::keyClick(Text(e), Qt::Key_Escape) : Klicke(e, weg);
        // Leaving the text box comes first, so OK and Abbrechen show its message.
        QCOMPARE(t.meldungen.titel(), escape ? QStringList() : QStringList{"Intervall zu groß"});
        QVERIFY(f->Daten().Intervall == (ok ? 2 : 6) && f->Daten().Geschwister == ok && f->Daten().Geaendert == ok);
        QVERIFY(!e->isVisible() && f->isEnabled());
    }
}

QTEST_MAIN(TestFormMinis)
#include "tst_formminis.moc"
