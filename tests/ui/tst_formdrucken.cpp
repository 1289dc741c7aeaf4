// The print dialog: its fills, the Enter rule of the size box, one document always chosen, OK
// and Cancel, the PDF mode, and through cups-test.sh a real print system.
#include "support_umgebung.h"

#include "druck/AufzeichnenderDrucker.h"
#include "output/qt/QtDrucker.h"
#include "ui/FormDrucken.h"
#include "ui/FormMinis.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFile>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>

// The entries, then "|" and the box's text.
QString Liste(const QComboBox *liste)
{
    QStringList l;
    for (int i = 0; i < liste->count(); ++i)
        l << liste->itemText(i);
    return l.join(',') + '|' + liste->currentText();
}

class TestFormDrucken : public QObject
{
    Q_OBJECT

    InitMini m_daten;
    TestMeldungen m_meldungen;
    TestUhr m_uhr;
    AufzeichnenderDrucker m_vorlage;
    AufzeichnenderDrucker *m_dr = nullptr;   // the printer of the last dialog opened without one
    std::unique_ptr<FormDrucken> m_dialog;

    // A loaded and shown dialog, on a copy of m_vorlage unless drucker is given.
    bool oeffne(std::unique_ptr<Drucker> drucker = nullptr)
    {
        if (!drucker)
            drucker.reset(m_dr = new AufzeichnenderDrucker(m_vorlage));
        m_dialog = std::make_unique<FormDrucken>(m_daten, m_meldungen, m_uhr, std::move(drucker));
        if (!m_dialog->FormLoad())
            return false;
        m_dialog->show();
        QApplication::setActiveWindow(m_dialog.get());
        return QTest::qWaitForWindowExposed(m_dialog.get());
    }
    template <class T = QComboBox>
    T *k(const char *name) const { return m_dialog->findChild<T *>(name); }
    void klicke(const char *name) { QTest::mouseClick(k<QAbstractButton>(name), Qt::LeftButton, {}, QPoint(6, 6)); }

private slots:
    void init()
    {
        m_daten = Beispieldaten({"Bauer"}, 1);
        m_meldungen.leeren();
        m_vorlage = AufzeichnenderDrucker({"Alpha", "Beta"}, {{"Arial", "Courier"}, {"Zapf"}});
    }
    void cleanup()
    {
        m_dialog.reset();
        Aufraeumen();
    }

    void ladenFuelltDieListen()
    {
        QVERIFY(oeffne());
        QCOMPARE(Liste(k("CmbDrucker")), "Alpha,Beta|Alpha");
        // Each printer made current while listed, then printer 0.
        QCOMPARE(m_dr->texte("waehleDrucker"), QStringList({"0", "1", "0"}));
        QCOMPARE(Liste(k("CmbSchriftart")), "Arial,Courier|Arial");
        QCOMPARE(Liste(k("CmbZeilenabstand")), "1,1.5,2,2.5,3|1");
        QCOMPARE(Liste(k("CmbSchriftgroesse")), "8,10,12,14|12");
        QCOMPARE(m_dialog->focusWidget(), k<QPushButton>("BtnAbbruch"));

        m_vorlage.schriften.clear();   // a printer that reports no fonts, or no printer at all
        QVERIFY(!oeffne());
        m_vorlage.drucker.clear();
        QVERIFY(!oeffne());
        QCOMPARE(m_meldungen.texte(), QStringList({"Kein Drucker installiert!", "Kein Drucker installiert!"}));
        QCOMPARE(m_meldungen.titel(), QStringList({"Fehler beim Drucken", "Fehler beim Drucken"}));
        QCOMPARE(m_meldungen.gezeigt()[1].symbol, Symbol::Kritisch);
    }

    void enterHaengtDieGroesseAn()
    {
        QVERIFY(oeffne());
        QLineEdit *feld = k("CmbSchriftgroesse")->lineEdit();
        feld->selectAll();
        QTest::keyClicks(feld, "9");
        QTest::keyClick(feld, Qt::Key_Return);
        QCOMPARE(Liste(k("CmbSchriftgroesse")), "8,10,12,14,9|");
        // Without a test, also twice; the Enter of the number pad too; OK is not pressed.
        QTest::keyClicks(feld, "12");
        QTest::keyClick(feld, Qt::Key_Enter, Qt::KeypadModifier);
        QCOMPARE(Liste(k("CmbSchriftgroesse")), "8,10,12,14,9,12|");
        QVERIFY(m_dialog->isVisible() && !m_dr->beendet);

        klicke("BtnOK");   // the emptied box: corrected to 10 with the message
        QCOMPARE(m_meldungen.texte(), QStringList{"Schriftgröße nicht durchführbar! Korrigiere auf 10."});
        QCOMPARE(k("CmbSchriftgroesse")->currentText(), "10");
        QCOMPARE(m_dr->texte("setzeSchriftGroesse").last(), "10");
    }

    void okDrucktMitDerWahlUndSchliesst()
    {
        QVERIFY(oeffne());
        k("CmbDrucker")->setFocus();
        QTest::keyClick(k("CmbDrucker"), Qt::Key_Down);
        QCOMPARE(Liste(k("CmbSchriftart")), "Zapf|Zapf");   // the fonts of the printer chosen
        k("CmbZeilenabstand")->setCurrentIndex(1);
        QStringList folge;
        for (const char *box : {"CheckPlan", "CheckAdressliste", "CheckPlan", "CheckAdressliste", "CheckPlan"}) {
            klicke(box);
            folge << QString("%1%2").arg(k<QCheckBox>("CheckAdressliste")->isChecked())
                         .arg(k<QCheckBox>("CheckPlan")->isChecked());
        }
        QCOMPARE(folge, QStringList({"10", "10", "11", "01", "01"}));   // the last checked box checks itself again
        klicke("BtnOK");
        QVERIFY(!m_dialog->isVisible() && m_dr->beendet);
        QCOMPARE(m_dr->texte("setzeSchriftName"), QStringList{"Zapf"});
        QVERIFY(m_dr->gedruckt("Adressverzeichnis aller Ministranten  (Stand 05.12.2026)").art.isEmpty());
        // Size 12: three steps of 1.5 x 24 below the title at T.
        QCOMPARE(m_dr->gedruckt("Freitag, den 01.01.2027, 9.30 Uhr: ").y, 50.0 + 3 * 36);

        QVERIFY(oeffne());
        klicke("BtnAbbruch");
        QVERIFY(!m_dialog->isVisible() && m_dr->texte("beendeDokument").isEmpty());
    }

    // PLAN.PDF beside the data file, after a question whose Cancel returns to the dialog; first in
    // a folder that does not exist.
    void pdfModusAusDemHauptfenster()
    {
        Testumgebung t;
        auto haupt = NeuesHauptfenster(t);
        haupt->Daten() = Beispieldaten({"Bauer"}, 1);
        haupt->MenueAktivieren();
        for (const QString &ordner : {t.pfad("fehlt"), t.ordner.path()}) {
            const QString pfad = ordner + "/PLAN.PDF", frage = "Druckausgabe wird unter " + pfad + " gespeichert";
            const bool fehlt = ordner.endsWith("fehlt");
            t.meldungen.leeren();
            haupt->Daten().Dateiname = ordner + "/gemeinde.prd";
            QVERIFY(Waehle(*haupt, "MnuPdfSpeichern"));
            auto *f = OffenesFenster<FormDrucken>();
            QVERIFY(f && !haupt->isEnabled());
            QCOMPARE(Liste(f->findChild<QComboBox *>("CmbDrucker")), "PDF-Datei|PDF-Datei");
            t.meldungen.antworte(Antwort::Abbrechen);
            QTest::mouseClick(f->findChild<QPushButton *>("BtnOK"), Qt::LeftButton);
            QVERIFY(f->isVisible() && !QFile::exists(pfad));
            QTest::mouseClick(f->findChild<QPushButton *>("BtnOK"), Qt::LeftButton);
            Aufraeumen();
            QVERIFY(!OffenesFenster<FormDrucken>() && haupt->isEnabled());
            QCOMPARE(QFile::exists(pfad), !fehlt);
            const QStringList fehler{"Datei " + pfad + " konnte nicht geschrieben werden."};
            QCOMPARE(t.meldungen.texte(), QStringList({frage, frage}) + (fehlt ? fehler : QStringList()));
            QCOMPARE(t.meldungen.titel(), QStringList(fehlt ? 3 : 2, "Als PDF speichern"));
            const auto &m = t.meldungen.gezeigt();
            QVERIFY(m[0].knoepfe == Knoepfe::OKAbbrechen && m[0].symbol == Symbol::Keins);
            QVERIFY(!fehlt || m[2].symbol == Symbol::Kritisch);
        }
    }

    // Run by cups-test.sh, which names its queue in PRADILON_CUPS_DRUCKER and checks what arrives.
    void cupsDruck()
    {
        const QString warteschlange = qEnvironmentVariable("PRADILON_CUPS_DRUCKER");
        if (warteschlange.isEmpty())
            QSKIP("PRADILON_CUPS_DRUCKER is not set; run through cups-test.sh");
        m_daten.Minis[0].Strasse = "Hauptstraße 1";
        QVERIFY(oeffne(std::make_unique<QtDrucker>()));
        const int index = k("CmbDrucker")->findText(warteschlange);
        QVERIFY2(index >= 0, qPrintable("not listed: " + warteschlange));
        k("CmbDrucker")->setCurrentIndex(index);
        emit k("CmbDrucker")->activated(index);   // as when the user picks it: it becomes current
        klicke("BtnOK");
        QCOMPARE(m_meldungen.texte(), QStringList());
        QVERIFY(!m_dialog->isVisible());
    }
};

QTEST_MAIN(TestFormDrucken)
#include "tst_formdrucken.moc"
