#pragma once

#include <QDialog>
#include <QString>

#include <memory>
#include <optional>

struct InitMini;
class Drucker;
class Meldungen;
class Uhr;
class QCheckBox;
class QComboBox;
class QPushButton;

// Where the print dialog gets its printer from: the system's printers, or an A4 PDF file. Tests
// install their own so that no real printer is needed.
class DruckerQuelle
{
public:
    virtual ~DruckerQuelle() = default;
    virtual std::unique_ptr<Drucker> drucker() = 0;
    virtual std::unique_ptr<Drucker> pdfDrucker(const QString &pfad) = 0;
};

// The Qt printers unless a test has installed another source.
DruckerQuelle &AktuelleDruckerQuelle();
// nullptr returns to the Qt printers.
void SetzeDruckerQuelle(DruckerQuelle *quelle);

// "Drucken": printer, font, size, spacing and the documents; OK runs the print job and closes.
// In PDF mode the printer list holds only "PDF-Datei" and OK writes the document to a file
// after asking.
class FormDrucken : public QDialog
{
    Q_OBJECT
public:
    FormDrucken(const InitMini &daten, Meldungen &meldungen, const Uhr &uhr, std::unique_ptr<Drucker> drucker,
                std::optional<QString> pdfPfad = std::nullopt, QWidget *parent = nullptr);
    ~FormDrucken() override;

    // A loaded dialog from the current printer source, or nullptr when loading failed (the
    // message has been shown). pdfPfad chooses the PDF mode.
    static FormDrucken *Laden(const InitMini &daten, Meldungen &meldungen, const Uhr &uhr,
                              std::optional<QString> pdfPfad = std::nullopt);

    // Fills the lists from the printer. False after "Kein Drucker installiert!" when the printer
    // service fails; the dialog must then not be shown.
    [[nodiscard]] bool FormLoad();

protected:
    void showEvent(QShowEvent *event) override;
    bool eventFilter(QObject *objekt, QEvent *event) override;

private:
    void FormActivate();
    void CmbDrucker_Click(int index);
    void CmbSchriftgroesse_KeyDown(int taste);
    void CheckAdressliste_Click();
    void CheckPlan_Click();
    void WasDrucken();
    void BtnOK_Click();
    void BtnAbbruch_Click();
    void FuelleSchriften();
    void MeldeKeinDrucker();
    [[nodiscard]] bool PdfBestaetigt();

    const InitMini &m_daten;
    Meldungen &m_meldungen;
    const Uhr &m_uhr;
    std::unique_ptr<Drucker> m_drucker;
    std::optional<QString> m_pdfPfad;

    QComboBox *m_cmbDrucker;
    QComboBox *m_cmbSchriftart;
    QComboBox *m_cmbZeilenabstand;
    QComboBox *m_cmbSchriftgroesse;
    QCheckBox *m_checkAdressliste;
    QCheckBox *m_checkPlan;
    QPushButton *m_btnOK;
    QPushButton *m_btnAbbruch;

    // Remembered states of the two check boxes, for WasDrucken.
    bool m_merkeAdressliste = true;
    bool m_merkePlan = true;
    bool m_aktiviert = false;
};
