#include "ui/FramePlan.h"

#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "plan/PlanGenerator.h"
#include "ui/Cp1252Eingabe.h"
#include "ui/Hauptfenster.h"

#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

// The generator works on the shared data; the panel itself only passes the typed texts on.
FramePlan::FramePlan(Meldungen &meldungen, Hauptfenster &hauptfenster, PlanGenerator &generator, const Uhr &uhr,
                     QWidget *parent)
    : QGroupBox(parent), m_meldungen(meldungen), m_hauptfenster(hauptfenster), m_generator(generator), m_uhr(uhr)
{
    setObjectName(QStringLiteral("FramePlan"));
    setTitle(QStringLiteral("Plan erstellen"));

    auto *label13 = new QLabel(QStringLiteral("Startdatum:"), this);
    label13->setObjectName(QStringLiteral("Label13"));
    auto *label14 = new QLabel(QStringLiteral("Enddatum:"), this);
    label14->setObjectName(QStringLiteral("Label14"));
    m_txtStartDatum = new QLineEdit(this);
    m_txtStartDatum->setObjectName(QStringLiteral("TxtStartDatum"));
    m_txtEndDatum = new QLineEdit(this);
    m_txtEndDatum->setObjectName(QStringLiteral("TxtEndDatum"));
    NurCp1252(m_txtStartDatum);
    NurCp1252(m_txtEndDatum);
    m_btnErstellen = new QPushButton(QStringLiteral("Erstellen"), this);
    m_btnErstellen->setObjectName(QStringLiteral("BtnErstellen"));
    m_btnAbbruch3 = new QPushButton(QStringLiteral("Abbrechen"), this);
    m_btnAbbruch3->setObjectName(QStringLiteral("BtnAbbruch3"));
    m_panelPlanAnzeige = new QLabel(this);
    m_panelPlanAnzeige->setObjectName(QStringLiteral("PanelPlanAnzeige"));
    m_panelPlanAnzeige->setFrameShape(QFrame::Panel);
    m_panelPlanAnzeige->setFrameShadow(QFrame::Sunken);
    m_panelPlanAnzeige->setAlignment(Qt::AlignCenter);
    m_panelPlanAnzeige->setMinimumWidth(m_panelPlanAnzeige->fontMetrics().horizontalAdvance(
                                            QStringLiteral("Bearbeitet:  100%"))
                                        + 24);

    auto *raster = new QGridLayout(this);
    raster->setHorizontalSpacing(24);
    raster->addWidget(label13, 0, 0);
    raster->addWidget(m_txtStartDatum, 0, 1);
    raster->addWidget(label14, 1, 0);
    raster->addWidget(m_txtEndDatum, 1, 1);
    raster->setRowMinimumHeight(2, 24);
    raster->addWidget(m_btnErstellen, 3, 0);
    raster->addWidget(m_panelPlanAnzeige, 3, 1);
    raster->addWidget(m_btnAbbruch3, 4, 0);
    raster->setRowStretch(5, 1);
    raster->setColumnStretch(2, 1);

    setTabOrder(m_txtStartDatum, m_txtEndDatum);
    setTabOrder(m_txtEndDatum, m_btnErstellen);
    setTabOrder(m_btnErstellen, m_btnAbbruch3);

    connect(m_txtStartDatum, &QLineEdit::textChanged, this, &FramePlan::TxtDatum_Change);
    connect(m_txtEndDatum, &QLineEdit::textChanged, this, &FramePlan::TxtDatum_Change);
    connect(m_btnErstellen, &QPushButton::clicked, this, &FramePlan::BtnErstellen_Click);
    connect(m_btnAbbruch3, &QPushButton::clicked, this, &FramePlan::BtnAbbruch3_Click);
    hide();
}

void FramePlan::MnuPlanErstellen_Click()
{
    m_hauptfenster.MenueDeaktivieren();
    show();
    m_btnErstellen->setEnabled(false);
    m_btnAbbruch3->setEnabled(true);
    m_panelPlanAnzeige->setText(QStringLiteral("Bearbeitet: 0%"));
    TxtDatum_Change();
    m_txtStartDatum->setFocus();
}

// Emptying a box does not disable "Erstellen" again; only opening the panel does.
void FramePlan::TxtDatum_Change()
{
    if (!m_txtStartDatum->text().isEmpty() && !m_txtEndDatum->text().isEmpty())
        m_btnErstellen->setEnabled(true);
}

void FramePlan::BtnErstellen_Click()
{
    const auto ergebnis = m_generator.BtnErstellen_Click(m_txtStartDatum->text(), m_txtEndDatum->text(),
                                                         m_meldungen, m_uhr,
                                                         [this](int prozent) { ZeigeFortschritt(prozent); });
    // A refused or failed computation leaves the panel open; "Abbrechen" is the way out.
    if (ergebnis == PlanGenerator::Ergebnis::Fertig) {
        hide();
        m_hauptfenster.MenueAktivieren();
    }
}

void FramePlan::ZeigeFortschritt(int prozent)
{
    m_panelPlanAnzeige->setText(QStringLiteral("Bearbeitet: ") + u' ' + QString::number(prozent) + u'%');
    // The computation does not return to the event loop, so the caption is painted at once.
    m_panelPlanAnzeige->repaint();
}

void FramePlan::BtnAbbruch3_Click()
{
    hide();
    m_hauptfenster.MenueAktivieren();
}

QSize FramePlan::sizeHint() const
{
    return QGroupBox::sizeHint().expandedTo(QSize(377, 213));
}
