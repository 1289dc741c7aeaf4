// The file browser on its own: start state, the lists and the pattern, clicks in the file list,
// the root folder, the drive list and the failure messages.
#include "support_umgebung.h"

#include "ui/FormFileBrw.h"

#include <QComboBox>
#include <QDir>
#include <QFile>
#include <QFileSystemModel>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QPushButton>
#include <QTest>
#include <QTreeView>

namespace {

struct Aufrufe {
    int laden = 0;
    QStringList gespeichert;   // Dateiname at each save
    bool ladenGelingt = true;
};

std::unique_ptr<FormFileBrw> NeuerBrowser(InitMini &d, TestMeldungen &m, Aufrufe &a, const QString &ordner,
                                          const QStringList &laufwerke = SystemLaufwerke())
{
    DateiProzeduren p{[&a] {
                          ++a.laden;
                          return a.ladenGelingt;
                      },
                      [&a, &d](bool) {
                          a.gespeichert << d.Dateiname;
                          d.Geaendert = false;
                          return SpeicherErgebnis::Gespeichert;
                      }};
    auto b = std::make_unique<FormFileBrw>(d, m, p, ordner, laufwerke);
    b->show();
    return b;
}

void LegeAn(const QString &pfad)
{
    QFile datei(pfad);
    if (!datei.open(QIODevice::WriteOnly))
        qFatal("cannot create %s", qPrintable(pfad));
}

QStringList Dateiliste(FormFileBrw &b)
{
    auto *liste = b.findChild<QListView *>("FileList");
    auto *modell = static_cast<QFileSystemModel *>(liste->model());
    QStringList namen;
    for (int i = 0; i < modell->rowCount(liste->rootIndex()); ++i)
        namen << modell->index(i, 0, liste->rootIndex()).data().toString();
    namen.sort();
    return namen;
}

QModelIndex Eintrag(FormFileBrw &b, const QString &name)
{
    auto *liste = b.findChild<QListView *>("FileList");
    auto *modell = static_cast<QFileSystemModel *>(liste->model());
    for (int i = 0; i < modell->rowCount(liste->rootIndex()); ++i) {
        QModelIndex index = modell->index(i, 0, liste->rootIndex());
        if (index.data().toString() == name)
            return index;
    }
    return {};
}

} // namespace

class TestFormFileBrw : public QObject
{
    Q_OBJECT

private slots:
    void startzustand();
    void dateilisteUndDateiformat();
    void klickUndDoppelklick();
    void wurzelOhneDoppeltenTrenner();
    void ordnerWechsel();
    void laufwerkAntwortetNicht();
    void findeDatei();
};

void TestFormFileBrw::startzustand()
{
    Testumgebung t;
    InitMini d;
    d.Dateiname = QStringLiteral("/irgendwo/x.prd");
    d.DateiLaden = true;
    Aufrufe a;
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path());

    QCOMPARE(d.AlterDateiname, QString("/irgendwo/x.prd"));
    QCOMPARE(b->pfad(), QDir::cleanPath(t.ordner.path()));
    QCOMPARE(b->findChild<QLabel *>("LabVerzStruk")->toolTip(), QDir::toNativeSeparators(b->pfad()));
    QCOMPARE(b->findChild<QLineEdit *>("TxtDatei")->text(), QString("*.prd"));
    auto *format = b->findChild<QComboBox *>("CmbDateiFormat");
    QCOMPARE(format->count(), 2);
    QCOMPARE(format->itemText(0), QString("Planformat (*.prd)"));
    QCOMPARE(format->itemText(1), QString("Alle Dateien (*.*)"));
    QCOMPARE(format->currentIndex(), 0);
    QVERIFY(!format->isEditable());
    for (const auto &[name, text] : QList<QPair<QString, QString>>{{"LabDatei", "Dateiname:"},
                                                                  {"LabDateiFormat", "Dateiformat:"},
                                                                  {"LabVerzeichnis", "Verzeichnisse:"},
                                                                  {"LabLaufwerk", "Laufwerke:"}})
        QCOMPARE(b->findChild<QLabel *>(name)->text(), text);
    QCOMPARE(b->findChild<QPushButton *>("CmdOK")->text(), QString("OK"));
    QCOMPARE(b->findChild<QPushButton *>("CmdAbbruch")->text(), QString("Abbruch"));
    // One root: no drive list.
    if (SystemLaufwerke().size() == 1)
        QVERIFY(!b->findChild<QComboBox *>("DriveList")->isVisible());
}

void TestFormFileBrw::dateilisteUndDateiformat()
{
    Testumgebung t;
    for (const char *name : {"a.prd", "B.PRD", "c.txt", "d"})
        LegeAn(t.pfad(name));
    InitMini d;
    d.DateiLaden = true;
    Aufrufe a;
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path());
    QTRY_COMPARE(Dateiliste(*b), (QStringList{"B.PRD", "a.prd"}));

    auto *format = b->findChild<QComboBox *>("CmbDateiFormat");
    auto *name = b->findChild<QLineEdit *>("TxtDatei");
    format->setCurrentIndex(1);
    QCOMPARE(name->text(), QString("*.*"));
    QTRY_COMPARE(Dateiliste(*b), (QStringList{"B.PRD", "a.prd", "c.txt", "d"}));
    format->setCurrentIndex(0);
    QCOMPARE(name->text(), QString("*.prd"));
    QTRY_COMPARE(Dateiliste(*b).size(), 2);

    // Typing "*.*" chooses the second format; other texts change nothing while typing.
    name->clear();
    QTest::keyClicks(name, "*.txt");
    QCOMPARE(format->currentIndex(), 0);
    name->clear();
    QTest::keyClicks(name, "*.*");
    QCOMPARE(format->currentIndex(), 1);
    QTRY_COMPARE(Dateiliste(*b).size(), 4);
}

void TestFormFileBrw::klickUndDoppelklick()
{
    Testumgebung t;
    LegeAn(t.pfad("eins.prd"));
    InitMini d;
    d.DateiLaden = true;
    Aufrufe a;
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path());
    QTRY_VERIFY(Eintrag(*b, "eins.prd").isValid());
    auto *liste = b->findChild<QListView *>("FileList");
    const QRect rechteck = liste->visualRect(Eintrag(*b, "eins.prd"));
    QTest::mouseClick(liste->viewport(), Qt::LeftButton, {}, rechteck.center());
    QCOMPARE(b->findChild<QLineEdit *>("TxtDatei")->text(), QString("eins.prd"));
    QCOMPARE(a.laden, 0);
    QTest::mouseDClick(liste->viewport(), Qt::LeftButton, {}, rechteck.center());
    QCOMPARE(a.laden, 1);
    QCOMPARE(d.Dateiname, QDir::toNativeSeparators(t.pfad("eins.prd")));
    QVERIFY(!b->isVisible());
}

void TestFormFileBrw::wurzelOhneDoppeltenTrenner()
{
    Testumgebung t;
    InitMini d;
    d.DateiSpeichernUnter = true;
    Aufrufe a;
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path());
    const QString wurzel = SystemLaufwerke().front();
    b->oeffneOrdner(wurzel);
    QCOMPARE(b->pfad(), QDir::cleanPath(wurzel));
    b->findChild<QLineEdit *>("TxtDatei")->setText("wurzel.prd");
    QTest::mouseClick(b->findChild<QPushButton *>("CmdOK"), Qt::LeftButton);
    // The save procedure is a fake here: nothing is written into the root folder.
    QCOMPARE(a.gespeichert, QStringList{QDir::toNativeSeparators(QDir::cleanPath(wurzel) + "wurzel.prd")});
    QVERIFY(!a.gespeichert.front().contains("//") && !a.gespeichert.front().contains("\\\\"));
}

void TestFormFileBrw::ordnerWechsel()
{
    Testumgebung t;
    QVERIFY(QDir(t.ordner.path()).mkdir("unter"));
    LegeAn(t.pfad("unter/tief.prd"));
    InitMini d;
    d.DateiLaden = true;
    Aufrufe a;
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path());
    auto *baum = b->findChild<QTreeView *>("DirList");
    auto *modell = static_cast<QFileSystemModel *>(baum->model());
    // A click in the folder tree opens the folder.
    baum->setCurrentIndex(modell->index(t.pfad("unter")));
    QCOMPARE(b->pfad(), t.pfad("unter"));
    QCOMPARE(b->findChild<QLabel *>("LabVerzStruk")->toolTip(), QDir::toNativeSeparators(t.pfad("unter")));
    QTRY_COMPARE(Dateiliste(*b), QStringList{"tief.prd"});
    b->findChild<QLineEdit *>("TxtDatei")->setText("tief.prd");
    QTest::mouseClick(b->findChild<QPushButton *>("CmdOK"), Qt::LeftButton);
    QCOMPARE(d.Dateiname, QDir::toNativeSeparators(t.pfad("unter/tief.prd")));
}

void TestFormFileBrw::laufwerkAntwortetNicht()
{
    Testumgebung t;
    InitMini d;
    d.DateiLaden = true;
    Aufrufe a;
    const QString fehlt = t.pfad("laufwerk-x");
    auto b = NeuerBrowser(d, t.meldungen, a, t.ordner.path(), {t.ordner.path() + "/", fehlt + "/"});
    auto *laufwerke = b->findChild<QComboBox *>("DriveList");
    QVERIFY(laufwerke->isVisible());
    QCOMPARE(laufwerke->currentIndex(), 0);
    laufwerke->setCurrentIndex(1);
    const QString name = QDir::toNativeSeparators(fehlt).toUpper();
    QCOMPARE(t.meldungen.titel(), QStringList{"Fehler bei Laufwerk " + name});
    QCOMPARE(t.meldungen.texte(), QStringList{"Laufwerk " + name +
                                              " antwortet nicht! Prüfen Sie, ob ein Datenträger eingelegt ist, "
                                              "oder ob das Laufwerk existiert."});
    QCOMPARE(t.meldungen.gezeigt().front().symbol, Symbol::Kritisch);
    QCOMPARE(laufwerke->currentIndex(), 0);
    QCOMPARE(b->pfad(), QDir::cleanPath(t.ordner.path()));
}

void TestFormFileBrw::findeDatei()
{
    Testumgebung t;
    for (const char *name : {"zwei.prd", "Eins.PRD", "drei.txt"})
        LegeAn(t.pfad(name));
    QCOMPARE(FindeDatei(t.ordner.path(), "zwei.prd"), std::optional<QString>("zwei.prd"));
    // Letter case does not matter for patterns; the first in name order counts.
    QCOMPARE(FindeDatei(t.ordner.path(), "*.prd"), std::optional<QString>("Eins.PRD"));
    QCOMPARE(FindeDatei(t.ordner.path(), "d*"), std::optional<QString>("drei.txt"));
    QCOMPARE(FindeDatei(t.ordner.path(), "*.*"), std::optional<QString>("drei.txt"));
    QCOMPARE(FindeDatei(t.ordner.path(), "z???.prd"), std::optional<QString>("zwei.prd"));
    QVERIFY(!FindeDatei(t.ordner.path(), "*.doc"));
    QVERIFY(!FindeDatei(t.ordner.path(), ""));
    QVERIFY(!FindeDatei(t.ordner.path(), "../" + QDir(t.ordner.path()).dirName() + "/zwei.prd"));
    QVERIFY(!FindeDatei(t.pfad("fehlt"), "*.prd"));
}

QTEST_MAIN(TestFormFileBrw)
#include "tst_formfilebrw.moc"
