#include "ui/FormDrucken.h"

#include "data/Meldungen.h"
#include "output/Druckauftrag.h"
#include "output/Drucker.h"
#include "output/qt/QtDrucker.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

#include <exception>

namespace {

class QtDruckerQuelle : public DruckerQuelle
{
public:
    std::unique_ptr<Drucker> drucker() override { return std::make_unique<QtDrucker>(); }
    std::unique_ptr<Drucker> pdfDrucker(const QString &pfad) override { return QtDrucker::pdfDatei(pfad); }
};

DruckerQuelle *g_druckerQuelle = nullptr;

constexpr int TastenCodeEnter = 13;

// Control sizes of the design, in pixels at 15 twips each.
QComboBox *NeueListe(const QString &name, int breite, QWidget *eltern)
{
    auto *liste = new QComboBox(eltern);
    liste->setObjectName(name);
    liste->setMinimumWidth(breite);
    return liste;
}

QLabel *NeuesLabel(const QString &name, const QString &text, QWidget *eltern)
{
    auto *label = new QLabel(text, eltern);
    label->setObjectName(name);
    return label;
}

} // namespace

DruckerQuelle &AktuelleDruckerQuelle()
{
    static QtDruckerQuelle qt;
    return g_druckerQuelle ? *g_druckerQuelle : qt;
}

void SetzeDruckerQuelle(DruckerQuelle *quelle)
{
    g_druckerQuelle = quelle;
}

FormDrucken::FormDrucken(const InitMini &daten, Meldungen &meldungen, const Uhr &uhr, std::unique_ptr<Drucker> drucker,
                         std::optional<QString> pdfPfad, QWidget *parent)
    : QDialog(parent), m_daten(daten), m_meldungen(meldungen), m_uhr(uhr), m_drucker(std::move(drucker)),
      m_pdfPfad(std::move(pdfPfad))
{
    setObjectName(QStringLiteral("FormDrucken"));
    setWindowTitle(QStringLiteral("Drucken"));

    auto *einstellungen = new QGroupBox(QStringLiteral("Einstellungen"), this);
    einstellungen->setObjectName(QStringLiteral("FrameEinstellungen"));
    m_cmbDrucker = NeueListe(QStringLiteral("CmbDrucker"), 157, einstellungen);
    m_cmbSchriftart = NeueListe(QStringLiteral("CmbSchriftart"), 213, einstellungen);
    m_cmbZeilenabstand = NeueListe(QStringLiteral("CmbZeilenabstand"), 57, einstellungen);
    m_cmbSchriftgroesse = NeueListe(QStringLiteral("CmbSchriftgroesse"), 57, einstellungen);
    m_cmbSchriftgroesse->setEditable(true);
    // Enter appends by its own rule, and a typed size must stay as typed, not completed.
    m_cmbSchriftgroesse->setInsertPolicy(QComboBox::NoInsert);
    m_cmbSchriftgroesse->setCompleter(nullptr);
    m_cmbSchriftgroesse->lineEdit()->installEventFilter(this);

    auto *raster = new QGridLayout(einstellungen);
    raster->setHorizontalSpacing(18);
    raster->addWidget(NeuesLabel(QStringLiteral("Label1"), QStringLiteral("Druckerauswahl"), einstellungen), 0, 0);
    raster->addWidget(m_cmbDrucker, 1, 0, Qt::AlignLeft);
    raster->addWidget(NeuesLabel(QStringLiteral("Label2"), QStringLiteral("Schriftart"), einstellungen), 2, 0);
    raster->addWidget(m_cmbSchriftart, 3, 0);
    raster->addWidget(NeuesLabel(QStringLiteral("Label5"), QStringLiteral("Zeilenabstand"), einstellungen), 0, 1);
    raster->addWidget(m_cmbZeilenabstand, 1, 1, Qt::AlignLeft);
    raster->addWidget(NeuesLabel(QStringLiteral("Label3"), QStringLiteral("Schriftgröße"), einstellungen), 2, 1);
    raster->addWidget(m_cmbSchriftgroesse, 3, 1, Qt::AlignLeft);
    raster->setRowMinimumHeight(2, 28);
    raster->setRowStretch(4, 1);

    auto *dokument = new QGroupBox(QStringLiteral("Dokument"), this);
    dokument->setObjectName(QStringLiteral("FrameDokument"));
    m_checkAdressliste = new QCheckBox(QStringLiteral("Adressliste"), dokument);
    m_checkAdressliste->setObjectName(QStringLiteral("CheckAdressliste"));
    m_checkPlan = new QCheckBox(QStringLiteral("Plan"), dokument);
    m_checkPlan->setObjectName(QStringLiteral("CheckPlan"));
    auto *spalte = new QVBoxLayout(dokument);
    spalte->addWidget(NeuesLabel(QStringLiteral("Label4"), QStringLiteral("Drucken ..."), dokument));
    spalte->addWidget(m_checkAdressliste);
    spalte->addWidget(m_checkPlan);
    dokument->setMinimumWidth(125);

    m_btnOK = new QPushButton(QStringLiteral("OK"), this);
    m_btnOK->setObjectName(QStringLiteral("BtnOK"));
    m_btnAbbruch = new QPushButton(QStringLiteral("Abbrechen"), this);
    m_btnAbbruch->setObjectName(QStringLiteral("BtnAbbruch"));
    for (QPushButton *k : {m_btnOK, m_btnAbbruch}) {
        // Enter belongs to the size box; no button takes it as a default.
        k->setAutoDefault(false);
        k->setDefault(false);
    }

    auto *rechts = new QVBoxLayout;
    rechts->addWidget(dokument);
    rechts->addStretch(1);
    rechts->addWidget(m_btnOK);
    rechts->addWidget(m_btnAbbruch);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(12, 12, 12, 12);
    layout->addWidget(einstellungen, 1);
    layout->addLayout(rechts);

    setTabOrder(m_cmbDrucker, m_cmbSchriftart);
    setTabOrder(m_cmbSchriftart, m_cmbZeilenabstand);
    setTabOrder(m_cmbZeilenabstand, m_cmbSchriftgroesse);
    setTabOrder(m_cmbSchriftgroesse, m_checkAdressliste);
    setTabOrder(m_checkAdressliste, m_checkPlan);
    setTabOrder(m_checkPlan, m_btnOK);
    setTabOrder(m_btnOK, m_btnAbbruch);

    connect(m_cmbDrucker, &QComboBox::activated, this, &FormDrucken::CmbDrucker_Click);
    connect(m_checkAdressliste, &QCheckBox::clicked, this, &FormDrucken::CheckAdressliste_Click);
    connect(m_checkPlan, &QCheckBox::clicked, this, &FormDrucken::CheckPlan_Click);
    connect(m_btnOK, &QPushButton::clicked, this, &FormDrucken::BtnOK_Click);
    connect(m_btnAbbruch, &QPushButton::clicked, this, &FormDrucken::BtnAbbruch_Click);
}

FormDrucken::~FormDrucken() = default;

FormDrucken *FormDrucken::Laden(const InitMini &daten, Meldungen &meldungen, const Uhr &uhr,
                                std::optional<QString> pdfPfad)
{
    try {
        DruckerQuelle &quelle = AktuelleDruckerQuelle();
        auto drucker = pdfPfad ? quelle.pdfDrucker(*pdfPfad) : quelle.drucker();
        auto dialog = std::make_unique<FormDrucken>(daten, meldungen, uhr, std::move(drucker), std::move(pdfPfad));
        if (dialog->FormLoad())
            return dialog.release();
    } catch (const std::exception &) {
        // Showing the dialog has no failure message of its own.
    }
    return nullptr;
}

bool FormDrucken::FormLoad()
{
    try {
        for (int i = 0; i < m_drucker->druckerAnzahl(); ++i) {
            m_drucker->waehleDrucker(i);
            m_cmbDrucker->addItem(m_drucker->druckerName(i));
        }
        m_drucker->waehleDrucker(0);
        m_cmbDrucker->setCurrentIndex(0);
        FuelleSchriften();
    } catch (const std::exception &) {
        MeldeKeinDrucker();
        return false;
    }
    m_cmbZeilenabstand->addItems({QStringLiteral("1"), QStringLiteral("1.5"), QStringLiteral("2"),
                                  QStringLiteral("2.5"), QStringLiteral("3")});
    m_cmbZeilenabstand->setCurrentIndex(0);
    m_cmbSchriftgroesse->addItems({QStringLiteral("8"), QStringLiteral("10"), QStringLiteral("12"), QStringLiteral("14")});
    m_cmbSchriftgroesse->setCurrentIndex(2);
    m_checkAdressliste->setChecked(true);
    m_checkPlan->setChecked(true);
    m_merkeAdressliste = m_merkePlan = true;
    return true;
}

void FormDrucken::FuelleSchriften()
{
    m_cmbSchriftart->clear();
    for (int i = 0; i < m_drucker->schriftAnzahl(); ++i)
        m_cmbSchriftart->addItem(m_drucker->schriftName(i));
    if (m_cmbSchriftart->count() == 0)
        throw DruckerFehler("der Drucker meldet keine Schriften");
    m_cmbSchriftart->setCurrentIndex(0);
}

void FormDrucken::MeldeKeinDrucker()
{
    m_meldungen.zeige(QStringLiteral("Kein Drucker installiert!"), Knoepfe::OK, Symbol::Kritisch,
                      QStringLiteral("Fehler beim Drucken"));
}

void FormDrucken::showEvent(QShowEvent *event)
{
    QDialog::showEvent(event);
    // Once per opening: coming back from another window must not move the focus.
    if (!m_aktiviert) {
        m_aktiviert = true;
        FormActivate();
    }
}

void FormDrucken::FormActivate()
{
    m_btnOK->setEnabled(true);
    m_btnAbbruch->setEnabled(true);
    m_btnAbbruch->setFocus(Qt::OtherFocusReason);
}

bool FormDrucken::eventFilter(QObject *objekt, QEvent *event)
{
    if (objekt == m_cmbSchriftgroesse->lineEdit() && event->type() == QEvent::KeyPress) {
        const int taste = static_cast<QKeyEvent *>(event)->key();
        if (taste == Qt::Key_Return || taste == Qt::Key_Enter) {
            CmbSchriftgroesse_KeyDown(TastenCodeEnter);
            return true;
        }
    }
    return QDialog::eventFilter(objekt, event);
}

void FormDrucken::CmbDrucker_Click(int index)
{
    try {
        m_drucker->waehleDrucker(index);
        FuelleSchriften();
    } catch (const std::exception &) {
        // A printer that vanished since the list was filled: as at loading.
        MeldeKeinDrucker();
        close();
    }
}

void FormDrucken::CmbSchriftgroesse_KeyDown(int taste)
{
    if (taste != TastenCodeEnter)
        return;
    m_cmbSchriftgroesse->addItem(m_cmbSchriftgroesse->currentText());
    m_cmbSchriftgroesse->setEditText(QString());
}

void FormDrucken::CheckAdressliste_Click()
{
    WasDrucken();
    m_merkeAdressliste = m_checkAdressliste->isChecked();
}

void FormDrucken::CheckPlan_Click()
{
    WasDrucken();
    m_merkePlan = m_checkPlan->isChecked();
}

void FormDrucken::WasDrucken()
{
    if (!m_checkAdressliste->isChecked() && !m_checkPlan->isChecked()) {
        m_checkAdressliste->setChecked(m_merkeAdressliste);
        m_checkPlan->setChecked(m_merkePlan);
    }
}

bool FormDrucken::PdfBestaetigt()
{
    return m_meldungen.zeige(QStringLiteral("Druckausgabe wird unter ") + *m_pdfPfad + QStringLiteral(" gespeichert"),
                             Knoepfe::OKAbbrechen, Symbol::Keins, QStringLiteral("Als PDF speichern")) == Antwort::OK;
}

void FormDrucken::BtnOK_Click()
{
    // Cancelling the question returns to the dialog, whose settings are still wanted.
    if (m_pdfPfad && !PdfBestaetigt())
        return;
    m_btnOK->setEnabled(false);
    m_btnAbbruch->setEnabled(false);
    DruckEinstellungen einstellungen{m_cmbSchriftart->currentText(), m_cmbSchriftgroesse->currentText(),
                                     m_cmbZeilenabstand->currentText(), m_checkAdressliste->isChecked(),
                                     m_checkPlan->isChecked()};
    Druckauftrag(*m_drucker, m_daten, m_meldungen, m_uhr).fuehreAus(einstellungen);
    m_cmbSchriftgroesse->setEditText(einstellungen.schriftgroesse);
    close();
}

void FormDrucken::BtnAbbruch_Click()
{
    close();
}
