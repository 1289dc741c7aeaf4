#include "ui/FormEinstellungen.h"

#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "data/Werte.h"

#include <QApplication>
#include <QCheckBox>
#include <QFocusEvent>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTimer>
#include <QToolButton>
#include <QVBoxLayout>

FormEinstellungen::FormEinstellungen(InitMini &daten, Meldungen &meldungen, QWidget *parent)
    : QDialog(parent), m_daten(daten), m_meldungen(meldungen)
{
    setObjectName(QStringLiteral("FormEinstellungen"));
    setWindowTitle(QStringLiteral("Einstellungen"));

    auto *rahmen = new QGroupBox(QStringLiteral("Plan"), this);
    rahmen->setObjectName(QStringLiteral("SSFrame1"));
    m_checkGeschwister = new QCheckBox(QStringLiteral("Geschwister zusammen einteilen"), rahmen);
    m_checkGeschwister->setObjectName(QStringLiteral("CheckGeschwister"));
    auto *label1 = new QLabel(
        QStringLiteral("Wieviele Gottesdienste sollen mindestens zwischen zwei Einteilungen liegen?"), rahmen);
    label1->setObjectName(QStringLiteral("Label1"));
    label1->setWordWrap(true);
    m_txtIntervall = new QLineEdit(rahmen);
    m_txtIntervall->setObjectName(QStringLiteral("TxtIntervall"));
    m_txtIntervall->setFixedWidth(61);   // 915 twips
    m_txtIntervall->installEventFilter(this);

    auto *spin = new QWidget(rahmen);
    spin->setObjectName(QStringLiteral("SpinBtnIntervall"));
    m_spinHoch = new QToolButton(spin);
    m_spinHoch->setObjectName(QStringLiteral("SpinBtnIntervallHoch"));
    m_spinHoch->setArrowType(Qt::UpArrow);
    m_spinRunter = new QToolButton(spin);
    m_spinRunter->setObjectName(QStringLiteral("SpinBtnIntervallRunter"));
    m_spinRunter->setArrowType(Qt::DownArrow);
    auto *spinSpalte = new QVBoxLayout(spin);
    spinSpalte->setContentsMargins(0, 0, 0, 0);
    spinSpalte->setSpacing(0);
    for (QToolButton *pfeil : {m_spinHoch, m_spinRunter}) {
        pfeil->setAutoRepeat(true);
        pfeil->setFixedSize(17, 12);
        spinSpalte->addWidget(pfeil);
    }
    connect(m_spinHoch, &QToolButton::clicked, this, &FormEinstellungen::SpinBtnIntervall_SpinUp);
    connect(m_spinRunter, &QToolButton::clicked, this, &FormEinstellungen::SpinBtnIntervall_SpinDown);

    auto *zeile = new QHBoxLayout;
    zeile->addWidget(m_txtIntervall);
    zeile->addWidget(spin);
    zeile->addStretch(1);
    auto *innen = new QVBoxLayout(rahmen);
    innen->addWidget(m_checkGeschwister);
    innen->addWidget(label1);
    innen->addLayout(zeile);
    innen->addStretch(1);
    rahmen->setMinimumWidth(261);   // 3915 twips

    m_btnOK = new QPushButton(QStringLiteral("OK"), this);
    m_btnOK->setObjectName(QStringLiteral("BtnOKEinstellungen"));
    m_btnAbbruch = new QPushButton(QStringLiteral("Abbrechen"), this);
    m_btnAbbruch->setObjectName(QStringLiteral("BtnAbbruchEinstellungen"));
    for (QPushButton *k : {m_btnOK, m_btnAbbruch}) {
        k->setMinimumWidth(105);   // 1575 twips
        k->setAutoDefault(false);
    }
    connect(m_btnOK, &QPushButton::clicked, this, &FormEinstellungen::BtnOKEinstellungen_Click);
    connect(m_btnAbbruch, &QPushButton::clicked, this, &FormEinstellungen::BtnAbbruchEinstellungen_Click);

    auto *knoepfe = new QVBoxLayout;
    knoepfe->addWidget(m_btnOK);
    knoepfe->addWidget(m_btnAbbruch);
    knoepfe->addStretch(1);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(16, 16, 16, 16);
    layout->setSpacing(12);
    layout->addWidget(rahmen, 1);
    layout->addLayout(knoepfe);

    setTabOrder(m_checkGeschwister, m_txtIntervall);
    setTabOrder(m_txtIntervall, m_btnOK);
    setTabOrder(m_btnOK, m_btnAbbruch);
}

void FormEinstellungen::showEvent(QShowEvent *event)
{
    QDialog::showEvent(event);
    // Filled once when the dialog appears: switching to another window and back must not
    // throw away what the user typed.
    if (!m_aktiviert) {
        m_aktiviert = true;
        FormActivate();
    }
}

void FormEinstellungen::FormActivate()
{
    m_checkGeschwister->setChecked(m_daten.Geschwister);
    m_txtIntervall->setText(QString::number(m_daten.Intervall));
    m_btnAbbruch->setFocus(Qt::OtherFocusReason);
}

bool FormEinstellungen::eventFilter(QObject *objekt, QEvent *event)
{
    if (objekt == m_txtIntervall) {
        if (event->type() == QEvent::FocusIn) {
            m_pruefungOffen = true;
        } else if (event->type() == QEvent::FocusOut) {
            // Leaving the program's window or a message box taking the focus is no leaving of the
            // text box.
            const Qt::FocusReason grund = static_cast<QFocusEvent *>(event)->reason();
            if (grund != Qt::ActiveWindowFocusReason && grund != Qt::PopupFocusReason && m_pruefungOffen) {
                // A message box opened while a mouse button is down would swallow the click
                // that moved the focus; the check waits for the button to come up.
                if (QGuiApplication::mouseButtons() != Qt::NoButton) {
                    if (!m_wartetAufLoslassen) {
                        m_wartetAufLoslassen = true;
                        qApp->installEventFilter(this);
                    }
                } else {
                    TxtIntervall_LostFocus();
                }
            }
        }
        return false;
    }
    if (m_wartetAufLoslassen && event->type() == QEvent::MouseButtonRelease) {
        m_wartetAufLoslassen = false;
        qApp->removeEventFilter(this);
        // After the release has been handled, so that a click on OK or Abbrechen runs first
        // and does the check itself.
        QTimer::singleShot(0, this, &FormEinstellungen::pruefeNachLoslassen);
    }
    return false;
}

void FormEinstellungen::pruefeNachLoslassen()
{
    if (m_pruefungOffen && focusWidget() != m_txtIntervall)
        TxtIntervall_LostFocus();
}

void FormEinstellungen::SpinBtnIntervall_SpinDown()
{
    const double v = ZahlWert(m_txtIntervall->text());
    if (v > 0)
        m_txtIntervall->setText(QString::number(v - 1, 'g', 15));
}

void FormEinstellungen::SpinBtnIntervall_SpinUp()
{
    const double v = ZahlWert(m_txtIntervall->text());
    if (v < 10)
        m_txtIntervall->setText(QString::number(v + 1, 'g', 15));
}

void FormEinstellungen::TxtIntervall_LostFocus()
{
    m_pruefungOffen = false;
    // A number beyond the 16-bit range is out of range like any other.
    std::optional<int16_t> n = RundeInt16(ZahlWert(m_txtIntervall->text()));
    if (!n || *n > 10 || *n < 0) {
        m_meldungen.zeige(QStringLiteral("Den Abstand zwischen zwei Einteilungen >10 oder <0 zu wählen, "
                                         "macht keinen Sinn. Korrigiere auf Default-Wert 2."),
                          Knoepfe::OK, Symbol::Information, QStringLiteral("Intervall zu groß"));
        n = 2;
    }
    m_txtIntervall->setText(QString::number(*n));
}

void FormEinstellungen::BtnOKEinstellungen_Click()
{
    if (m_pruefungOffen)
        TxtIntervall_LostFocus();
    m_daten.Geschwister = m_checkGeschwister->isChecked();
    m_daten.Intervall = RundeInt16(ZahlWert(m_txtIntervall->text())).value_or(2);
    m_daten.Geaendert = true;
    close();
}

void FormEinstellungen::BtnAbbruchEinstellungen_Click()
{
    if (m_pruefungOffen)
        TxtIntervall_LostFocus();
    close();
}
