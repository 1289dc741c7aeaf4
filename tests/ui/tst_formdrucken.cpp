// The print dialog: its lists and their fills, the Enter rule of the size box, the rule that one
// document stays chosen, OK running the job, the PDF mode, and how the main window opens it.
#include "support_umgebung.h"

#include "druck/AufzeichnenderDrucker.h"
#include "output/TextExport.h"
#include "output/qt/QtDrucker.h"
#include "ui/FormDrucken.h"
#include "ui/FormMinis.h"
#include "ui/Werkzeugknopf.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFile>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>

#include <functional>

namespace {

// Hands out recording printers copied from a template; remembers the last one.
class TestDruckerQuelle : public DruckerQuelle
{
public:
    std::unique_ptr<Drucker> drucker() override { return neu(vorlage); }
    std::unique_ptr<Drucker> pdfDrucker(const QString &pfad) override
    {
        pdfPfad = pfad;
        AufzeichnenderDrucker pdf;
        pdf.drucker = {QStringLiteral("PDF-Datei")};
        pdf.schriften = {{QStringLiteral("PDF-Datei"), {QStringLiteral("Sans")}}};
        return neu(pdf);
    }

    AufzeichnenderDrucker vorlage;
    AufzeichnenderDrucker *letzter = nullptr;
    QString pdfPfad;

private:
    std::unique_ptr<Drucker> neu(const AufzeichnenderDrucker &v)
    {
        auto d = std::make_unique<AufzeichnenderDrucker>(v);
        letzter = d.get();
        return d;
    }
};

// Message boxes that also run a probe when they appear, to look at the dialog mid-job.
class BeobachteteMeldungen : public TestMeldungen
{
public:
    Antwort zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel) override
    {
        if (beimZeigen)
            beimZeigen();
        return TestMeldungen::zeige(text, knoepfe, symbol, titel);
    }
    std::function<void()> beimZeigen;
};

// On the box itself: a check box takes clicks only on its indicator and caption.
void Klicke(QCheckBox *box)
{
    QTest::mouseClick(box, Qt::LeftButton, {}, QPoint(6, box->height() / 2));
}

QStringList Eintraege(const QComboBox *liste)
{
    QStringList l;
    for (int i = 0; i < liste->count(); ++i)
        l << liste->itemText(i);
    return l;
}

template <class T>
T *Kind(const QWidget *w, const char *name)
{
    T *k = w->findChild<T *>(QLatin1String(name));
    if (!k)
        qFatal("missing %s", name);
    return k;
}

} // namespace

class TestFormDrucken : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void cleanup();

    void ladenFuelltDieListenUndWaehltVor();
    void ohneDruckerOderSchriftenNurDieMeldung();
    void druckerwahlErsetztDieSchriften();
    void enterHaengtDieGroesseAnUndLeertDasFeld();
    void einDokumentBleibtImmerGewaehlt();
    void aktivierungGibtAbbrechenDenFokus();
    void okDrucktMitDenEinstellungenUndSchliesst();
    void abbrechenDrucktNichts();
    void pdfModusFragtUndSchreibtDieDatei();
    void pdfDateiNichtSchreibbar();
    void hauptfensterGesperrtSolangeDerDialogOffenIst();
    void ohneDruckerBleibtDasHauptfensterFrei();
    void pdfAusDemHauptfensterNebenDieDatendatei();

private:
    // A loaded and shown dialog on a copy of m_quelle.vorlage (or on drucker).
    FormDrucken *oeffne(std::unique_ptr<Drucker> drucker = nullptr, std::optional<QString> pdf = std::nullopt);

    InitMini m_daten;
    BeobachteteMeldungen m_meldungen;
    TestUhr m_uhr;
    TestDruckerQuelle m_quelle;
    std::unique_ptr<FormDrucken> m_dialog;
};

void TestFormDrucken::init()
{
    m_daten = Beispieldaten({QStringLiteral("Bauer")}, 1);
    m_meldungen.leeren();
    m_meldungen.beimZeigen = nullptr;
    m_quelle.vorlage = AufzeichnenderDrucker();
    m_quelle.vorlage.drucker = {QStringLiteral("Alpha"), QStringLiteral("Beta")};
    m_quelle.vorlage.schriften = {{QStringLiteral("Alpha"), {QStringLiteral("Arial"), QStringLiteral("Courier")}},
                                  {QStringLiteral("Beta"), {QStringLiteral("Zapf")}}};
    SetzeDruckerQuelle(&m_quelle);
}

void TestFormDrucken::cleanup()
{
    m_dialog.reset();
    SetzeDruckerQuelle(nullptr);
    Aufraeumen();
}

FormDrucken *TestFormDrucken::oeffne(std::unique_ptr<Drucker> drucker, std::optional<QString> pdf)
{
    if (!drucker)
        drucker = m_quelle.drucker();
    m_dialog = std::make_unique<FormDrucken>(m_daten, m_meldungen, m_uhr, std::move(drucker), std::move(pdf));
    if (!m_dialog->FormLoad())
        return nullptr;
    m_dialog->show();
    QApplication::setActiveWindow(m_dialog.get());
    if (!QTest::qWaitForWindowExposed(m_dialog.get()))
        return nullptr;
    return m_dialog.get();
}

void TestFormDrucken::ladenFuelltDieListenUndWaehltVor()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    QCOMPARE(f->windowTitle(), QStringLiteral("Drucken"));
    AufzeichnenderDrucker *dr = m_quelle.letzter;

    auto *drucker = Kind<QComboBox>(f, "CmbDrucker");
    QCOMPARE(Eintraege(drucker), QStringList({"Alpha", "Beta"}));
    QCOMPARE(drucker->currentText(), QStringLiteral("Alpha"));
    // Each printer made current while listed, then printer 0; the fonts are those of printer 0.
    QStringList gewaehlt;
    for (const auto &a : dr->aufrufe)
        if (a.art == QLatin1String("waehleDrucker"))
            gewaehlt << a.text;
    QCOMPARE(gewaehlt, QStringList({"0", "1", "0"}));
    auto *schrift = Kind<QComboBox>(f, "CmbSchriftart");
    QCOMPARE(Eintraege(schrift), QStringList({"Arial", "Courier"}));
    QCOMPARE(schrift->currentText(), QStringLiteral("Arial"));

    auto *abstand = Kind<QComboBox>(f, "CmbZeilenabstand");
    QCOMPARE(Eintraege(abstand), QStringList({"1", "1.5", "2", "2.5", "3"}));
    QCOMPARE(abstand->currentText(), QStringLiteral("1"));
    auto *groesse = Kind<QComboBox>(f, "CmbSchriftgroesse");
    QCOMPARE(Eintraege(groesse), QStringList({"8", "10", "12", "14"}));
    QCOMPARE(groesse->currentText(), QStringLiteral("12"));
    QVERIFY(groesse->isEditable());

    QVERIFY(Kind<QCheckBox>(f, "CheckAdressliste")->isChecked());
    QVERIFY(Kind<QCheckBox>(f, "CheckPlan")->isChecked());
    QCOMPARE(Kind<QCheckBox>(f, "CheckAdressliste")->text(), QStringLiteral("Adressliste"));
    QCOMPARE(Kind<QCheckBox>(f, "CheckPlan")->text(), QStringLiteral("Plan"));
    QCOMPARE(Kind<QGroupBox>(f, "FrameEinstellungen")->title(), QStringLiteral("Einstellungen"));
    QCOMPARE(Kind<QGroupBox>(f, "FrameDokument")->title(), QStringLiteral("Dokument"));
    const QStringList labels{"Druckerauswahl", "Schriftart", "Schriftgröße", "Drucken ...", "Zeilenabstand"};
    for (int i = 0; i < labels.size(); ++i)
        QCOMPARE(Kind<QLabel>(f, qPrintable(QStringLiteral("Label%1").arg(i + 1)))->text(), labels[i]);
    QCOMPARE(Kind<QPushButton>(f, "BtnOK")->text(), QStringLiteral("OK"));
    QCOMPARE(Kind<QPushButton>(f, "BtnAbbruch")->text(), QStringLiteral("Abbrechen"));
    QVERIFY(m_meldungen.gezeigt().empty());
    QVERIFY(!dr->beendet);
}

void TestFormDrucken::ohneDruckerOderSchriftenNurDieMeldung()
{
    for (bool mitDrucker : {false, true}) {
        m_meldungen.leeren();
        AufzeichnenderDrucker leer;
        if (mitDrucker)
            leer.schriften.clear();   // a printer that reports no fonts
        else
            leer.drucker.clear();
        m_dialog = std::make_unique<FormDrucken>(m_daten, m_meldungen, m_uhr,
                                                 std::make_unique<AufzeichnenderDrucker>(leer));
        QVERIFY(!m_dialog->FormLoad());
        QCOMPARE(m_meldungen.gezeigt().size(), size_t(1));
        const auto &m = m_meldungen.gezeigt()[0];
        QCOMPARE(m.text, QStringLiteral("Kein Drucker installiert!"));
        QCOMPARE(m.titel, QStringLiteral("Fehler beim Drucken"));
        QCOMPARE(m.symbol, Symbol::Kritisch);
        QCOMPARE(m.knoepfe, Knoepfe::OK);
    }
}

void TestFormDrucken::druckerwahlErsetztDieSchriften()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    auto *drucker = Kind<QComboBox>(f, "CmbDrucker");
    drucker->setFocus();
    QTest::keyClick(drucker, Qt::Key_Down);
    QCOMPARE(drucker->currentText(), QStringLiteral("Beta"));
    QCOMPARE(Eintraege(Kind<QComboBox>(f, "CmbSchriftart")), QStringList({"Zapf"}));
    QCOMPARE(Kind<QComboBox>(f, "CmbSchriftart")->currentText(), QStringLiteral("Zapf"));
    QCOMPARE(m_quelle.letzter->aufrufe.back().text, QStringLiteral("1"));

    // The job then runs on the chosen printer with its font.
    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QVERIFY(m_quelle.letzter->beendet);
    QCOMPARE(m_quelle.letzter->gedruckt(QStringLiteral("Vorname0 Bauer")).art, QStringLiteral("drucke"));
    bool zapf = false;
    for (const auto &a : m_quelle.letzter->aufrufe)
        zapf = zapf || (a.art == QLatin1String("setzeSchriftName") && a.text == QLatin1String("Zapf"));
    QVERIFY(zapf);
}

void TestFormDrucken::enterHaengtDieGroesseAnUndLeertDasFeld()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    auto *groesse = Kind<QComboBox>(f, "CmbSchriftgroesse");
    QLineEdit *feld = groesse->lineEdit();
    feld->selectAll();
    QTest::keyClicks(feld, QStringLiteral("9"));
    QTest::keyClick(feld, Qt::Key_Return);
    QCOMPARE(Eintraege(groesse), QStringList({"8", "10", "12", "14", "9"}));
    QCOMPARE(groesse->currentText(), QString());
    // No test, duplicates too; the numeric-pad Enter counts the same.
    QTest::keyClicks(feld, QStringLiteral("1"));
    QTest::keyClick(feld, Qt::Key_Enter, Qt::KeypadModifier);
    QCOMPARE(Eintraege(groesse), QStringList({"8", "10", "12", "14", "9", "1"}));
    QTest::keyClicks(feld, QStringLiteral("12"));
    QTest::keyClick(feld, Qt::Key_Return);
    QCOMPARE(Eintraege(groesse).count(QStringLiteral("12")), 2);
    QVERIFY(f->isVisible());                    // Enter does not press OK
    QVERIFY(!m_quelle.letzter->beendet);

    // Printing with the emptied box: corrected to 10 with the message.
    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QCOMPARE(m_meldungen.texte(), QStringList({"Schriftgröße nicht durchführbar! Korrigiere auf 10."}));
    QCOMPARE(groesse->currentText(), QStringLiteral("10"));
    QCOMPARE(m_quelle.letzter->gedruckt(QStringLiteral("Vorname0 Bauer")).groesse, 10.0);
}

void TestFormDrucken::einDokumentBleibtImmerGewaehlt()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    auto *adressen = Kind<QCheckBox>(f, "CheckAdressliste");
    auto *plan = Kind<QCheckBox>(f, "CheckPlan");

    Klicke(plan);
    QVERIFY(!plan->isChecked());
    Klicke(adressen);   // the last checked box checks itself again
    QVERIFY(adressen->isChecked());
    QVERIFY(!plan->isChecked());

    Klicke(plan);
    Klicke(adressen);
    QVERIFY(!adressen->isChecked());
    QVERIFY(plan->isChecked());
    Klicke(plan);
    QVERIFY(plan->isChecked());
    QVERIFY(!adressen->isChecked());

    // The keyboard goes the same way.
    plan->setFocus();
    QTest::keyClick(plan, Qt::Key_Space);
    QVERIFY(plan->isChecked());
}

void TestFormDrucken::aktivierungGibtAbbrechenDenFokus()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    QCOMPARE(f->focusWidget(), Kind<QPushButton>(f, "BtnAbbruch"));
    QVERIFY(Kind<QPushButton>(f, "BtnOK")->isEnabled());
    QVERIFY(Kind<QPushButton>(f, "BtnAbbruch")->isEnabled());
}

void TestFormDrucken::okDrucktMitDenEinstellungenUndSchliesst()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    Kind<QComboBox>(f, "CmbSchriftart")->setCurrentIndex(1);
    Kind<QComboBox>(f, "CmbZeilenabstand")->setCurrentIndex(1);   // 1.5
    Klicke(Kind<QCheckBox>(f, "CheckAdressliste"));
    Kind<QComboBox>(f, "CmbSchriftgroesse")->setEditText(QStringLiteral("25"));

    // Both buttons are disabled while the job runs (seen when the size message appears).
    bool knoepfeAus = false;
    m_meldungen.beimZeigen = [&] {
        knoepfeAus = !Kind<QPushButton>(f, "BtnOK")->isEnabled() && !Kind<QPushButton>(f, "BtnAbbruch")->isEnabled();
    };
    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QVERIFY(knoepfeAus);
    QCOMPARE(m_meldungen.titel(), QStringList({"Falsche Schriftgröße"}));

    AufzeichnenderDrucker *dr = m_quelle.letzter;
    QVERIFY(dr->beendet);
    QVERIFY(!f->isVisible());
    bool courier = false;
    for (const auto &a : dr->aufrufe)
        courier = courier || (a.art == QLatin1String("setzeSchriftName") && a.text == QLatin1String("Courier"));
    QVERIFY(courier);
    QCOMPARE(dr->gedruckt(QStringLiteral("Adressverzeichnis aller Ministranten  (Stand 05.12.2026)")).art, QString());
    // Title at T = 50, the first heading three steps of 1.5 x 20 below it.
    QCOMPARE(dr->gedruckt(QStringLiteral("Ministrantenplan vom 01.01.2027 bis 01.01.2027")).y, 50.0);
    QCOMPARE(dr->gedruckt(QStringLiteral("Freitag, den 01.01.2027, 9.30 Uhr: ")).y, 50.0 + 3 * 30);
}

void TestFormDrucken::abbrechenDrucktNichts()
{
    FormDrucken *f = oeffne();
    QVERIFY(f);
    QTest::mouseClick(Kind<QPushButton>(f, "BtnAbbruch"), Qt::LeftButton);
    QVERIFY(!f->isVisible());
    QCOMPARE(m_quelle.letzter->anzahl(QStringLiteral("beendeDokument")), 0);
    QVERIFY(m_quelle.letzter->texte().empty());
}

void TestFormDrucken::pdfModusFragtUndSchreibtDieDatei()
{
    QTemporaryDir ordner;
    const QString pfad = ordner.filePath(QStringLiteral("PLAN.PDF"));
    FormDrucken *f = oeffne(QtDrucker::pdfDatei(pfad), pfad);
    QVERIFY(f);
    QCOMPARE(Eintraege(Kind<QComboBox>(f, "CmbDrucker")), QStringList({"PDF-Datei"}));
    QVERIFY(Kind<QComboBox>(f, "CmbSchriftart")->count() > 0);

    m_meldungen.antworte(Antwort::Abbrechen);
    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QCOMPARE(m_meldungen.gezeigt().size(), size_t(1));
    const auto &frage = m_meldungen.gezeigt()[0];
    QCOMPARE(frage.text, QStringLiteral("Druckausgabe wird unter ") + pfad + QStringLiteral(" gespeichert"));
    QCOMPARE(frage.titel, QStringLiteral("Als PDF speichern"));
    QCOMPARE(frage.knoepfe, Knoepfe::OKAbbrechen);
    QCOMPARE(frage.symbol, Symbol::Keins);
    QVERIFY(!QFile::exists(pfad));
    QVERIFY(f->isVisible());
    QVERIFY(Kind<QPushButton>(f, "BtnOK")->isEnabled());

    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QCOMPARE(m_meldungen.gezeigt().size(), size_t(2));
    QVERIFY(!f->isVisible());
    QFile pdf(pfad);
    QVERIFY(pdf.open(QIODevice::ReadOnly));
    QCOMPARE(pdf.read(5), QByteArray("%PDF-"));
}

void TestFormDrucken::pdfDateiNichtSchreibbar()
{
    QTemporaryDir ordner;
    const QString pfad = ordner.filePath(QStringLiteral("fehlt/PLAN.PDF"));
    FormDrucken *f = oeffne(QtDrucker::pdfDatei(pfad), pfad);
    QVERIFY(f);
    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QCOMPARE(m_meldungen.gezeigt().size(), size_t(2));
    const auto &m = m_meldungen.gezeigt()[1];
    QCOMPARE(m.text, QStringLiteral("Datei ") + pfad + QStringLiteral(" konnte nicht geschrieben werden."));
    QCOMPARE(m.titel, QStringLiteral("Als PDF speichern"));
    QCOMPARE(m.symbol, Symbol::Kritisch);
    QCOMPARE(m.knoepfe, Knoepfe::OK);
    QVERIFY(!QFile::exists(pfad));
}

void TestFormDrucken::hauptfensterGesperrtSolangeDerDialogOffenIst()
{
    Testumgebung t;
    auto haupt = NeuesHauptfenster(t);
    haupt->Daten() = Beispieldaten({QStringLiteral("Bauer")}, 1);
    haupt->MenueAktivieren();

    QVERIFY(Waehle(*haupt, QStringLiteral("MnuDrucken")));
    FormDrucken *f = OffenesFenster<FormDrucken>();
    QVERIFY(f);
    QVERIFY(!haupt->isEnabled());
    QCOMPARE(SichtbaresBild(*haupt, QStringLiteral("Print")), QStringLiteral("Down"));
    QCOMPARE(Eintraege(Kind<QComboBox>(f, "CmbDrucker")), QStringList({"Alpha", "Beta"}));

    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    Aufraeumen();
    QVERIFY(!OffenesFenster<FormDrucken>());
    QVERIFY(haupt->isEnabled());
    QCOMPARE(SichtbaresBild(*haupt, QStringLiteral("Print")), QStringLiteral("Up"));
    QVERIFY(t.meldungen.gezeigt().empty());

    // The toolbar button opens it the same way; a fresh dialog every time.
    QTest::mouseClick(haupt->knopf(FormMinis::Knopf::Print).up(), Qt::LeftButton);
    f = OffenesFenster<FormDrucken>();
    QVERIFY(f);
    QCOMPARE(Kind<QComboBox>(f, "CmbSchriftgroesse")->currentText(), QStringLiteral("12"));
    QTest::keyClick(f, Qt::Key_Escape);
    Aufraeumen();
    QVERIFY(haupt->isEnabled());
    QCOMPARE(SichtbaresBild(*haupt, QStringLiteral("Print")), QStringLiteral("Up"));
}

void TestFormDrucken::ohneDruckerBleibtDasHauptfensterFrei()
{
    Testumgebung t;
    auto haupt = NeuesHauptfenster(t);
    haupt->Daten() = Beispieldaten({QStringLiteral("Bauer")}, 1);
    haupt->MenueAktivieren();
    m_quelle.vorlage.drucker.clear();

    QVERIFY(Waehle(*haupt, QStringLiteral("MnuDrucken")));
    QVERIFY(!OffenesFenster<FormDrucken>());
    QCOMPARE(t.meldungen.texte(), QStringList({"Kein Drucker installiert!"}));
    QVERIFY(haupt->isEnabled());
    QCOMPARE(SichtbaresBild(*haupt, QStringLiteral("Print")), QStringLiteral("Up"));
}

void TestFormDrucken::pdfAusDemHauptfensterNebenDieDatendatei()
{
    Testumgebung t;
    auto haupt = NeuesHauptfenster(t);
    haupt->Daten() = Beispieldaten({QStringLiteral("Bauer")}, 1);
    haupt->Daten().Dateiname = t.pfad(QStringLiteral("gemeinde.prd"));
    haupt->MenueAktivieren();
    m_quelle.vorlage.drucker.clear();   // PDF needs no printer

    QVERIFY(Waehle(*haupt, QStringLiteral("MnuPdfSpeichern")));
    FormDrucken *f = OffenesFenster<FormDrucken>();
    QVERIFY(f);
    const QString pfad = PfadNebenDatei(t.pfad(QStringLiteral("gemeinde.prd")), QStringLiteral("PLAN.PDF"));
    QCOMPARE(m_quelle.pdfPfad, pfad);
    QCOMPARE(Eintraege(Kind<QComboBox>(f, "CmbDrucker")), QStringList({"PDF-Datei"}));
    QVERIFY(!haupt->isEnabled());

    QTest::mouseClick(Kind<QPushButton>(f, "BtnOK"), Qt::LeftButton);
    QCOMPARE(t.meldungen.texte().value(0), QStringLiteral("Druckausgabe wird unter ") + pfad + QStringLiteral(" gespeichert"));
    QVERIFY(m_quelle.letzter->beendet);
    Aufraeumen();
    QVERIFY(haupt->isEnabled());
}

QTEST_MAIN(TestFormDrucken)
#include "tst_formdrucken.moc"
