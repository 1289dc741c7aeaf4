// The info window at program start and the help: the help file's path, the viewer's two entry
// points and the help text itself.
#include "support_umgebung.h"

#include "ui/FormInfo.h"
#include "ui/FormMinis.h"
#include "ui/Hilfe.h"

#include <QFile>
#include <QLabel>
#include <QPushButton>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTest>
#include <QTextBrowser>

namespace {

QString Hilfedatei()
{
    return QStringLiteral(PRADILON_QUELLEN "/help/pradilon.hlp");
}

QString Hilfetext()
{
    QFile datei(Hilfedatei());
    if (!datei.open(QIODevice::ReadOnly))
        return {};
    return QString::fromUtf8(datei.readAll());
}

} // namespace

class TestFormInfo : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { Aufraeumen(); }

    void programmstart();
    void hilfeDateiPfad();
    void hilfefensterEinstiegspunkte();
    void hilfefensterOhneDatei();
    void hilfetextNenntDieBeschriftungen();
    void hilfetextVerweiseFuehrenZuAnkern();
};

void TestFormInfo::programmstart()
{
    Testumgebung t;
    FormMinis haupt(t.umgebung());
    QVERIFY(!haupt.isVisible());
    auto *info = new FormInfo(haupt, t.hilfe, t.ordner.path());
    // The load step names the help file and shows the main window, which stays usable.
    QCOMPARE(t.hilfe.datei(), t.ordner.path() + "/pradilon.hlp");
    QVERIFY(haupt.isVisible());
    QVERIFY(haupt.isEnabled());
    info->show();

    QCOMPARE(info->windowTitle(), QString("PRADILON 1.00"));
    QCOMPARE(info->palette().color(QPalette::Window), QColor(Qt::black));
    const QList<std::tuple<QString, QString, QColor>> texte = {
        {"Label1", "PRADILON 1.00", Qt::red},
        {"Label2", "Programm zur rechnerunterstützten Erstellung eines Ministrantenplans", Qt::cyan},
        {"Label3", "Version 1.00, Stand: Mai 2002", Qt::cyan}};
    for (const auto &[name, text, farbe] : texte) {
        auto *l = info->findChild<QLabel *>(name);
        QCOMPARE(l->text(), text);
        QCOMPARE(l->palette().color(QPalette::WindowText), farbe);
        QVERIFY(l->font().bold());
    }
    QVERIFY(info->findChild<QLabel *>("Label1")->font().italic());
    QCOMPARE(info->findChild<QLabel *>("Label1")->font().pointSize(), 24);
    const QStringList zeilen = info->findChild<QLabel *>("LabCopyright")->text().split('\n');
    QCOMPARE(zeilen.size(), 2);
    QVERIFY(!zeilen[0].trimmed().isEmpty() && !zeilen[1].trimmed().isEmpty());

    auto *ok = info->findChild<QPushButton *>("CmdOK");
    QCOMPARE(ok->text(), QString("OK"));
    QTest::mouseClick(ok, Qt::LeftButton);
    QVERIFY(!info->isVisible());
    QVERIFY(!ok->isEnabled());
    QVERIFY(haupt.isEnabled());
    QVERIFY(haupt.isVisible());

    // Shown again while the main window is visible: the help file is not named again.
    t.hilfe.setzeDatei("vorher");
    auto *nochmal = new FormInfo(haupt, t.hilfe, "/anderswo");
    QCOMPARE(t.hilfe.datei(), QString("vorher"));
    nochmal->close();
}

void TestFormInfo::hilfeDateiPfad()
{
    QCOMPARE(HilfeDateiPfad("/opt/pradilon"), QString("/opt/pradilon/pradilon.hlp"));
    QCOMPARE(HilfeDateiPfad("/opt/pradilon/"), QString("/opt/pradilon/pradilon.hlp"));
    QCOMPARE(HilfeDateiPfad("/"), QString("/pradilon.hlp"));
    QCOMPARE(HilfeDateiPfad("C:\\"), QString("C:\\pradilon.hlp"));
    QCOMPARE(HilfeDateiPfad("C:/Programme/Pradilon"), QString("C:/Programme/Pradilon/pradilon.hlp"));
}

void TestFormInfo::hilfefensterEinstiegspunkte()
{
    HilfeFenster hilfe;
    hilfe.setzeDatei(Hilfedatei());
    hilfe.ZeigeInhalt();
    QVERIFY(hilfe.fenster() && hilfe.fenster()->isVisible());
    // Its own window: a disabled main window does not disable it.
    QVERIFY(!hilfe.fenster()->parentWidget());
    QTextBrowser *browser = hilfe.browser();
    QCOMPARE(browser->source().fragment(), QString("inhalt"));
    QVERIFY(browser->toPlainText().contains("Pradilon – Hilfe: Inhalt"));
    QVERIFY(browser->toPlainText().contains("Öffnen, Speichern und Beenden"));
    browser->resize(500, 300);
    QCoreApplication::processEvents();

    hilfe.ZeigeHilfeZurHilfe();
    QCOMPARE(browser->source().fragment(), QString("hilfe-zur-hilfe"));
    // The section lies at the end, so the view has scrolled down to it.
    QTRY_VERIFY(browser->verticalScrollBar()->value() > 0);
    QTest::mouseClick(hilfe.fenster()->findChild<QPushButton *>("BtnHilfeZurueck"), Qt::LeftButton);
    QCOMPARE(browser->source().fragment(), QString("inhalt"));
    QTest::mouseClick(hilfe.fenster()->findChild<QPushButton *>("BtnHilfeSchliessen"), Qt::LeftButton);
    QVERIFY(!hilfe.fenster()->isVisible());
}

void TestFormInfo::hilfefensterOhneDatei()
{
    Testumgebung t;
    HilfeFenster hilfe;
    hilfe.setzeDatei(t.pfad("pradilon.hlp"));
    hilfe.ZeigeInhalt();
    QVERIFY(hilfe.fenster()->isVisible());
    QVERIFY(hilfe.browser()->toPlainText().contains("wurde nicht gefunden"));
    QVERIFY(hilfe.browser()->toPlainText().contains(t.pfad("pradilon.hlp")));
}

void TestFormInfo::hilfetextNenntDieBeschriftungen()
{
    const QString text = Hilfetext();
    QVERIFY(!text.isEmpty());
    for (const char *beschriftung :
         {"Datei öffnen", "Speichern unter", "Adressliste als Text speichern", "Plan als Text speichern",
          "Drucken ...", "Als PDF speichern", "Programm beenden", "Liste ...", "Termine ...", "Plan anzeigen",
          "Plan erstellen", "Einstellungen", "Inhalt - F1", "Hilfe zur Hilfe", "Geschwister zusammen einteilen",
          "Wieviele Gottesdienste sollen mindestens zwischen zwei Einteilungen liegen?",
          "reguläre Gottesdienste", "Ausnahmen/Feiertage", "nicht einteilen", "Oberministrant", "Suchkriterien",
          "Planformat (*.prd)", "Alle Dateien (*.*)", "Datei speichern unter", "PLAN.TXT", "ADRESS.TXT",
          "Intervall zu groß", "Druckerauswahl", "Schriftgröße", "Zeilenabstand", "Startdatum", "Enddatum"})
        QVERIFY2(text.contains(QString::fromUtf8(beschriftung)), beschriftung);
}

void TestFormInfo::hilfetextVerweiseFuehrenZuAnkern()
{
    const QString text = Hilfetext();
    QSet<QString> anker;
    for (const auto &m : QRegularExpression(R"re(<a name="([^"]+)")re").globalMatch(text))
        anker.insert(m.captured(1));
    QVERIFY(anker.contains("inhalt"));
    QVERIFY(anker.contains("hilfe-zur-hilfe"));
    int verweise = 0;
    for (const auto &m : QRegularExpression(R"re(<a href="#([^"]+)")re").globalMatch(text)) {
        QVERIFY2(anker.contains(m.captured(1)), qPrintable(m.captured(1)));
        ++verweise;
    }
    QVERIFY(verweise >= 10);
}

QTEST_MAIN(TestFormInfo)
#include "tst_forminfo.moc"
