// The main window: start state, menu tree, toolbar, clock, idle and editing state, shortcuts,
// help entry points and the secondary windows it opens.
#include "support_umgebung.h"

#include "ui/FormEinstellungen.h"
#include "ui/FormFileBrw.h"
#include "ui/FormInfo.h"
#include "ui/FormMinis.h"
#include "ui/FormPlan.h"
#include "ui/Werkzeugknopf.h"

#include <QAction>
#include <QFile>
#include <QLabel>
#include <QMenu>
#include <QMenuBar>
#include <QPushButton>
#include <QTest>
#include <QTimer>

class TestFormMinis : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { Aufraeumen(); }

    void menuebaumMitBeschriftungenUndStartzustand();
    void werkzeugleisteImStartzustand();
    void bilderSind24x22UndUnterscheidenSich();
    void nurDasUpBildReagiert();
    void titelUndUhr();
    void bearbeitungszustandUndZurueck();
    void menueAktivierenSchaltetNurEin();
    void menueAktivierenMitMinisUndPlan();
    void tastenkuerzelNurBeiErreichbaremEintrag();
    void hilfeEinstiegspunkte();
    void infoSperrtHauptfensterBisOK();
    void sekundaerfensterBleibtBedienbarUndJedesSchliessenStelltHer();
    void planAnzeigeDruecktNeuKnopf();
    void textexporteSchreibenNebenDieDatei();
};

void TestFormMinis::menuebaumMitBeschriftungenUndStartzustand()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);

    const QList<QPair<QString, QString>> menues = {
        {"MnuDatei", "&Datei"}, {"MnuBearbeiten", "&Bearbeiten"}, {"MnuAnsicht", "An&sicht"},
        {"MnuAusführen", "&Ausführen"}, {"MnuOptionen", "&Optionen"}, {"MnuHilfe", "&Hilfe"}};
    const QList<QAction *> oben = f->menuBar()->actions();
    QCOMPARE(oben.size(), menues.size());
    for (int i = 0; i < menues.size(); ++i) {
        auto *m = f->findChild<QMenu *>(menues[i].first);
        QVERIFY2(m, qPrintable(menues[i].first));
        QCOMPARE(oben[i], m->menuAction());
        QCOMPARE(m->title(), menues[i].second);
    }

    // Items in order, "-" for a separator; the flag is the start state.
    struct Eintrag {
        const char *name;
        const char *text;
        bool an;
    };
    const QList<QPair<QString, QList<Eintrag>>> baum = {
        {"MnuDatei",
         {{"MnuLaden", "Datei &öffnen ...", true},
          {"MnuSpeichern", "&Speichern", false},
          {"MnuSpeichernUnter", "Speichern &unter ...", false},
          {"MnuSep0", "-", true},
          {"MnuAdressenSpeichern", "A&dressliste als Text speichern", false},
          {"MnuPlanSpeichern", "&Plan als Text speichern", false},
          {"MnuSep1", "-", true},
          {"MnuDrucken", "&Drucken ...", false},
          {"MnuPdfSpeichern", "Als &PDF speichern ...", false},
          {"MnuSep2", "-", true},
          {"MnuProgrammBeenden", "Programm &beenden", true}}},
        {"MnuBearbeiten", {{"MnuListe", "&Liste ...", true}, {"MnuTermine", "&Termine ...", true}}},
        {"MnuAnsicht", {{"MnuPlanAnzeigen", "Plan &anzeigen", true}}},
        {"MnuAusführen", {{"MnuPlanErstellen", "&Plan erstellen ...", true}}},
        {"MnuOptionen", {{"MnuEinstellungen", "Einstellungen ...", true}}},
        {"MnuHilfe",
         {{"MnuInhalt", "I&nhalt - F1", true},
          {"MnuHilfeZurHilfe", "Hilfe &zur Hilfe", true},
          {"MnuSep3", "-", true},
          {"MnuInfo", "&Info", true}}},
    };
    for (const auto &[menuName, eintraege] : baum) {
        const QList<QAction *> ist = f->findChild<QMenu *>(menuName)->actions();
        QCOMPARE(ist.size(), eintraege.size());
        for (int i = 0; i < eintraege.size(); ++i) {
            const Eintrag &e = eintraege[i];
            QCOMPARE(ist[i]->objectName(), QString::fromUtf8(e.name));
            if (QByteArray(e.text) == "-") {
                QVERIFY(ist[i]->isSeparator());
            } else {
                QCOMPARE(ist[i]->text(), QString::fromUtf8(e.text));
                QVERIFY2(ist[i]->isEnabled() == e.an, e.name);
            }
        }
    }
    QVERIFY(MenueAn(*f, "MnuDatei"));
    QVERIFY(MenueAn(*f, "MnuBearbeiten"));
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QVERIFY(!MenueAn(*f, "MnuAusführen"));
    QVERIFY(MenueAn(*f, "MnuOptionen"));
    QVERIFY(MenueAn(*f, "MnuHilfe"));

    for (const char *rahmen : {"FrameMinis", "FrameGodi", "FramePlan"})
        QVERIFY2(!f->findChild<QWidget *>(rahmen)->isVisible(), rahmen);
}

void TestFormMinis::werkzeugleisteImStartzustand()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Dis"));
    QCOMPARE(SichtbaresBild(*f, "Print"), QString("Dis"));
    QCOMPARE(SichtbaresBild(*f, "Search"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Dis"));
    QCOMPARE(SichtbaresBild(*f, "Help"), QString("Up"));
    QVERIFY(!f->findChild<QWidget *>("ImHelpDis"));

    const QList<QPair<QString, QString>> tipps = {{"ImOpenUp", "Öffnen"},       {"ImSaveUp", "Speichern"},
                                                  {"ImPrintUp", "Drucken"},     {"ImSearchUp", "Einstellungen"},
                                                  {"ImNewUp", "Plan anzeigen"}, {"ImHelpUp", "Hilfe"}};
    for (const auto &[bild, tipp] : tipps)
        QCOMPARE(f->findChild<QWidget *>(bild)->toolTip(), tipp);

    // The buttons sit left to right in the order of the design, the clock to their right.
    int links = -1;
    for (const char *bild : {"ImOpenUp", "ImSaveDis", "ImPrintDis", "ImSearchUp", "ImNewDis", "ImHelpUp"}) {
        auto *w = f->findChild<QWidget *>(bild);
        const int x = w->mapTo(f.get(), QPoint(0, 0)).x();
        QVERIFY2(x > links, bild);
        links = x;
    }
    QVERIFY(f->findChild<QWidget *>("PanelDatum")->mapTo(f.get(), QPoint(0, 0)).x() > links);
}

void TestFormMinis::bilderSind24x22UndUnterscheidenSich()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    for (const char *knopf : {"Open", "Save", "Print", "Search", "New", "Help"}) {
        QList<QImage> bilder;
        for (const char *zustand : {"Up", "Down", "Dis"}) {
            auto *l = f->findChild<QLabel *>(QStringLiteral("Im%1%2").arg(knopf, zustand));
            if (!l)
                continue;
            const QImage bild = l->pixmap().toImage();
            QCOMPARE(bild.size(), QSize(24, 22));
            QCOMPARE(l->size(), QSize(24, 22));
            bilder << bild;
        }
        QVERIFY(bilder.size() >= 2);
        for (int i = 0; i < bilder.size(); ++i)
            for (int j = i + 1; j < bilder.size(); ++j)
                QVERIFY2(bilder[i] != bilder[j], knopf);
        // Raised border in Up (white top left), sunken in Down (black top left).
        QCOMPARE(bilder[0].pixelColor(0, 0), QColor(Qt::white));
        QCOMPARE(bilder[1].pixelColor(0, 0), QColor(Qt::black));
    }
}

void TestFormMinis::nurDasUpBildReagiert()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    // Greyed Save, Print and New: a click does nothing.
    for (const char *bild : {"ImSaveDis", "ImPrintDis", "ImNewDis"})
        QTest::mouseClick(f->findChild<QWidget *>(bild), Qt::LeftButton);
    QVERIFY(f->isEnabled());
    QVERIFY(t.meldungen.gezeigt().empty());

    QTest::mouseClick(f->findChild<QWidget *>("ImOpenUp"), Qt::LeftButton);
    auto *browser = OffenesFenster<FormFileBrw>();
    QVERIFY(browser);
    QCOMPARE(browser->windowTitle(), QString("Datei öffnen"));
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Down"));
    // The pressed image does not open a second browser.
    QTest::mouseClick(f->findChild<QWidget *>("ImOpenDown"), Qt::LeftButton);
    int offen = 0;
    for (QWidget *w : QApplication::topLevelWidgets())
        offen += qobject_cast<FormFileBrw *>(w) && w->isVisible();
    QCOMPARE(offen, 1);
    browser->close();
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
}

void TestFormMinis::titelUndUhr()
{
    Testumgebung t;
    t.uhr.setze(QDateTime(QDate(2027, 3, 4), QTime(5, 6, 7)));
    auto f = NeuesHauptfenster(t);
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + f->Daten().Dateiname.toUpper());
    auto *panel = f->findChild<QLabel *>("PanelDatum");
    QCOMPARE(panel->text(), QString("04.03.2027 05:06:07"));
    QVERIFY(panel->width() >= panel->fontMetrics().horizontalAdvance(panel->text()));
    auto *timer = f->findChild<QTimer *>("TimerDatum");
    QVERIFY(timer && timer->isActive());
    QCOMPARE(timer->interval(), 1000);
    t.uhr.setze(QDateTime(QDate(2027, 12, 31), QTime(23, 59, 58)));
    QTRY_COMPARE_WITH_TIMEOUT(panel->text(), QString("31.12.2027 23:59:58"), 3000);
}

void TestFormMinis::bearbeitungszustandUndZurueck()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuListe"));
    QVERIFY(f->findChild<QWidget *>("FrameMinis")->isVisible());
    for (const char *menue : {"MnuDatei", "MnuBearbeiten", "MnuAnsicht", "MnuAusführen", "MnuOptionen"})
        QVERIFY2(!MenueAn(*f, menue), menue);
    QVERIFY(MenueAn(*f, "MnuHilfe"));
    for (const char *eintrag : {"MnuInhalt", "MnuHilfeZurHilfe", "MnuInfo"})
        QVERIFY2(Erreichbar(*f, eintrag), eintrag);
    for (const char *knopf : {"Open", "Save", "Print", "Search", "New"})
        QCOMPARE(SichtbaresBild(*f, knopf), QString("Dis"));
    QCOMPARE(SichtbaresBild(*f, "Help"), QString("Up"));
    // No second frame can be opened.
    QVERIFY(!Waehle(*f, "MnuTermine"));
    QVERIFY(!Waehle(*f, "MnuPlanErstellen"));

    // Cancel with an empty roster: only the always-on parts come back.
    QTest::mouseClick(f->findChild<QPushButton *>("BtnAbbruch"), Qt::LeftButton);
    QVERIFY(!f->findChild<QWidget *>("FrameMinis")->isVisible());
    QVERIFY(MenueAn(*f, "MnuDatei") && MenueAn(*f, "MnuBearbeiten") && MenueAn(*f, "MnuOptionen"));
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QVERIFY(!MenueAn(*f, "MnuAusführen"));
    for (const char *eintrag : {"MnuSpeichern", "MnuSpeichernUnter", "MnuAdressenSpeichern", "MnuPlanSpeichern",
                                "MnuDrucken", "MnuPdfSpeichern"})
        QVERIFY2(!Erreichbar(*f, eintrag), eintrag);
    QCOMPARE(SichtbaresBild(*f, "Open"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "Search"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Dis"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Dis"));

    // The services page and the plan panel go the same way.
    QVERIFY(Waehle(*f, "MnuTermine"));
    QVERIFY(f->findChild<QWidget *>("FrameGodi")->isVisible());
    QVERIFY(!MenueAn(*f, "MnuDatei"));
    f->MenueAktivieren();
    f->findChild<QWidget *>("FrameGodi")->hide();
    f->Daten().AnzahlMinis = 1;
    f->MenueAktivieren();
    QVERIFY(Waehle(*f, "MnuPlanErstellen"));
    QVERIFY(f->findChild<QWidget *>("FramePlan")->isVisible());
    QVERIFY(!MenueAn(*f, "MnuAusführen"));
    QTest::mouseClick(f->findChild<QPushButton *>("BtnAbbruch3"), Qt::LeftButton);
    QVERIFY(!f->findChild<QWidget *>("FramePlan")->isVisible());
    QVERIFY(MenueAn(*f, "MnuAusführen"));
    QVERIFY(Erreichbar(*f, "MnuSpeichern"));
}

void TestFormMinis::menueAktivierenSchaltetNurEin()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten().AnzahlMinis = 2;
    f->Daten().AnzahlPlanEintraege = 3;
    f->MenueAktivieren();
    QVERIFY(Erreichbar(*f, "MnuSpeichern"));
    QVERIFY(MenueAn(*f, "MnuAnsicht"));
    // The conditions no longer hold, but MenueAktivieren never disables.
    f->Daten().AnzahlMinis = 0;
    f->Daten().AnzahlPlanEintraege = 0;
    f->MenueAktivieren();
    QVERIFY(Erreichbar(*f, "MnuSpeichern"));
    QVERIFY(MenueAn(*f, "MnuAnsicht"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Up"));
    // Through the editing state the groups fall back to their conditions.
    f->MenueDeaktivieren();
    f->MenueAktivieren();
    QVERIFY(!Erreichbar(*f, "MnuSpeichern"));
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Dis"));
}

void TestFormMinis::menueAktivierenMitMinisUndPlan()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    f->Daten().AnzahlMinis = 1;
    f->MenueDeaktivieren();
    f->MenueAktivieren();
    for (const char *eintrag : {"MnuSpeichern", "MnuSpeichernUnter", "MnuAdressenSpeichern", "MnuPlanSpeichern",
                                "MnuDrucken", "MnuPdfSpeichern", "MnuPlanErstellen"})
        QVERIFY2(Erreichbar(*f, eintrag), eintrag);
    QCOMPARE(SichtbaresBild(*f, "Save"), QString("Up"));
    QCOMPARE(SichtbaresBild(*f, "Print"), QString("Up"));
    // The plan group waits for a plan.
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Dis"));
    f->Daten().AnzahlPlanEintraege = 1;
    f->MenueAktivieren();
    QVERIFY(Erreichbar(*f, "MnuPlanAnzeigen"));
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Up"));
}

void TestFormMinis::tastenkuerzelNurBeiErreichbaremEintrag()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QCOMPARE(Aktion(*f, "MnuLaden")->shortcut(), QKeySequence("Ctrl+O"));
    QCOMPARE(Aktion(*f, "MnuSpeichern")->shortcut(), QKeySequence("Ctrl+S"));
    QCOMPARE(Aktion(*f, "MnuDrucken")->shortcut(), QKeySequence("Ctrl+P"));
    QCOMPARE(Aktion(*f, "MnuProgrammBeenden")->shortcut(), QKeySequence("Ctrl+Q"));

    // In the editing state "Datei öffnen" is under a disabled menu: Strg+O does nothing.
    f->MenueDeaktivieren();
    QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
    QVERIFY(!OffenesFenster<FormFileBrw>());
    QTest::keyClick(f.get(), Qt::Key_Q, Qt::ControlModifier);
    QVERIFY(t.meldungen.gezeigt().empty());
    f->MenueAktivieren();

    // Strg+S with the item disabled writes nothing even with changes.
    f->Daten().Geaendert = true;
    f->Daten().Dateiname = t.pfad("kurz.prd");
    QTest::keyClick(f.get(), Qt::Key_S, Qt::ControlModifier);
    QVERIFY(!QFile::exists(t.pfad("kurz.prd")));

    f->Daten() = Beispieldaten({"Abel"});
    f->Daten().Geaendert = true;
    f->Daten().Dateiname = t.pfad("kurz.prd");
    f->MenueAktivieren();
    QTest::keyClick(f.get(), Qt::Key_S, Qt::ControlModifier);
    QVERIFY(QFile::exists(t.pfad("kurz.prd")));

    t.meldungen.antworte(Antwort::Abbrechen);
    f->Daten().Geaendert = true;
    QTest::keyClick(f.get(), Qt::Key_Q, Qt::ControlModifier);
    QCOMPARE(t.meldungen.titel(), QStringList{"Programm beenden"});
    QVERIFY(f->isVisible());

    QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
    auto *browser = OffenesFenster<FormFileBrw>();
    QVERIFY(browser);
    browser->close();
}

void TestFormMinis::hilfeEinstiegspunkte()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuInhalt"));
    QCOMPARE(t.hilfe.inhalt, 1);
    QVERIFY(Waehle(*f, "MnuHilfeZurHilfe"));
    QCOMPARE(t.hilfe.hilfeZurHilfe, 1);
    QTest::mouseClick(f->findChild<QWidget *>("ImHelpUp"), Qt::LeftButton);
    QCOMPARE(t.hilfe.inhalt, 2);
    QTest::keyClick(f.get(), Qt::Key_F1);
    QCOMPARE(t.hilfe.inhalt, 3);

    // In the editing state help stays reachable.
    f->MenueDeaktivieren();
    QVERIFY(Waehle(*f, "MnuInhalt"));
    QTest::mouseClick(f->findChild<QWidget *>("ImHelpUp"), Qt::LeftButton);
    QCOMPARE(t.hilfe.inhalt, 5);
    f->MenueAktivieren();

    // F1 also from a secondary window, while the main window is disabled.
    f->Einstellungen();
    auto *einstellungen = OffenesFenster<FormEinstellungen>();
    QVERIFY(einstellungen);
    QVERIFY(!f->isEnabled());
    QTest::keyClick(einstellungen->focusWidget() ? einstellungen->focusWidget() : einstellungen, Qt::Key_F1);
    QCOMPARE(t.hilfe.inhalt, 6);
    QVERIFY(einstellungen->isVisible());
    einstellungen->close();
}

void TestFormMinis::infoSperrtHauptfensterBisOK()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    QVERIFY(Waehle(*f, "MnuInfo"));
    auto *info = OffenesFenster<FormInfo>();
    QVERIFY(info);
    QVERIFY(!f->isEnabled());
    QVERIFY(info->isEnabled());
    // The help file is named only at program start, not again from the menu.
    QVERIFY(t.hilfe.datei().isEmpty());
    // The disabled main window takes no input.
    QTest::keyClick(f.get(), Qt::Key_O, Qt::ControlModifier);
    QVERIFY(!OffenesFenster<FormFileBrw>());
    QTest::mouseClick(info->findChild<QPushButton *>("CmdOK"), Qt::LeftButton);
    QVERIFY(!info->isVisible());
    QVERIFY(f->isEnabled());
    Aufraeumen();
    QVERIFY(!OffenesFenster<FormInfo>());

    // Escape and the close box close it the same way.
    QVERIFY(Waehle(*f, "MnuInfo"));
    info = OffenesFenster<FormInfo>();
    QTest::keyClick(info, Qt::Key_Escape);
    QVERIFY(f->isEnabled());
    QVERIFY(Waehle(*f, "MnuInfo"));
    OffenesFenster<FormInfo>()->close();
    QVERIFY(f->isEnabled());
}

void TestFormMinis::sekundaerfensterBleibtBedienbarUndJedesSchliessenStelltHer()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    // Enabling the main window again must not enable the menus that were off.
    f->Einstellungen();
    OffenesFenster<FormEinstellungen>()->close();
    QVERIFY(!MenueAn(*f, "MnuAnsicht"));
    QVERIFY(!MenueAn(*f, "MnuAusführen"));
    QVERIFY(MenueAn(*f, "MnuDatei"));

    f->Daten().AnzahlMinis = 1;
    f->Daten().AnzahlPlanEintraege = 1;
    f->MenueAktivieren();

    // close box
    QVERIFY(Waehle(*f, "MnuEinstellungen"));
    auto *einstellungen = OffenesFenster<FormEinstellungen>();
    QVERIFY(einstellungen && einstellungen->isEnabled());
    QVERIFY(!einstellungen->parentWidget());
    QVERIFY(!f->isEnabled());
    QCOMPARE(SichtbaresBild(*f, "Search"), QString("Down"));
    QPointer<QWidget> weg = einstellungen;
    einstellungen->close();
    QVERIFY(f->isEnabled());
    QCOMPARE(SichtbaresBild(*f, "Search"), QString("Up"));
    Aufraeumen();
    QVERIFY(weg.isNull());

    // Escape
    QTest::mouseClick(f->findChild<QWidget *>("ImSearchUp"), Qt::LeftButton);
    einstellungen = OffenesFenster<FormEinstellungen>();
    QVERIFY(einstellungen);
    weg = einstellungen;
    QTest::keyClick(einstellungen, Qt::Key_Escape);
    QVERIFY(f->isEnabled());
    QCOMPARE(SichtbaresBild(*f, "Search"), QString("Up"));
    Aufraeumen();
    QVERIFY(weg.isNull());

    // The browser restores the title and resets its flag when it closes.
    f->Daten().Dateiname = t.pfad("neu.prd");
    QVERIFY(Waehle(*f, "MnuLaden"));
    QVERIFY(f->Daten().DateiLaden);
    auto *browser = OffenesFenster<FormFileBrw>();
    QTest::mouseClick(browser->findChild<QPushButton *>("CmdAbbruch"), Qt::LeftButton);
    QVERIFY(!f->Daten().DateiLaden);
    QCOMPARE(f->windowTitle(), "Ministrantenplan - " + t.pfad("neu.prd").toUpper());
}

void TestFormMinis::planAnzeigeDruecktNeuKnopf()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    SchreibeBeispiel(t.pfad("plan.prd"), Beispieldaten({"Abel"}, 2));
    f->Daten().Dateiname = t.pfad("plan.prd");
    QVERIFY(f->Laden());
    QVERIFY(Waehle(*f, "MnuPlanAnzeigen"));
    auto *plan = OffenesFenster<FormPlan>();
    QVERIFY(plan);
    QVERIFY(plan->isEnabled());
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Down"));
    QTest::keyClick(plan, Qt::Key_Escape);
    QVERIFY(!plan->isVisible());
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Up"));
    QVERIFY(f->isEnabled());

    QTest::mouseClick(f->findChild<QWidget *>("ImNewUp"), Qt::LeftButton);
    plan = OffenesFenster<FormPlan>();
    QVERIFY(plan);
    QTest::mouseClick(plan->findChild<QPushButton *>("BtnOK"), Qt::LeftButton);
    QCOMPARE(SichtbaresBild(*f, "New"), QString("Up"));
    QVERIFY(f->isEnabled());
}

void TestFormMinis::textexporteSchreibenNebenDieDatei()
{
    Testumgebung t;
    auto f = NeuesHauptfenster(t);
    SchreibeBeispiel(t.pfad("daten.prd"), Beispieldaten({"Abel", "Berg"}, 1));
    f->Daten().Dateiname = t.pfad("daten.prd");
    QVERIFY(f->Laden());
    QVERIFY(Waehle(*f, "MnuPlanSpeichern"));
    QVERIFY(QFile::exists(t.pfad("PLAN.TXT")));
    QVERIFY(Waehle(*f, "MnuAdressenSpeichern"));
    QVERIFY(QFile::exists(t.pfad("ADRESS.TXT")));
    // The address list is dated with the program's clock.
    QVERIFY(Dateizeilen(t.pfad("ADRESS.TXT")).join('\n').contains("05.12.2026"));
}

QTEST_MAIN(TestFormMinis)
#include "tst_formminis.moc"
