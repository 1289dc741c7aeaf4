#include "ui/FormInfo.h"

#include "ui/Hilfe.h"

#include <QCloseEvent>
#include <QGuiApplication>
#include <QHideEvent>
#include <QLabel>
#include <QPushButton>
#include <QScreen>
#include <QVBoxLayout>

namespace {

QLabel *beschriftung(QWidget *eltern, const QString &name, const QString &text, const QColor &farbe, int punkt,
                     bool kursiv)
{
    auto *l = new QLabel(text, eltern);
    l->setObjectName(name);
    QFont f = l->font();
    if (punkt > 0)
        f.setPointSize(punkt);
    f.setBold(true);
    f.setItalic(kursiv);
    l->setFont(f);
    QPalette p = l->palette();
    p.setColor(QPalette::WindowText, farbe);
    l->setPalette(p);
    l->setWordWrap(true);
    return l;
}

} // namespace

FormInfo::FormInfo(QWidget &hauptfenster, Hilfe &hilfe, const QString &programmOrdner, QWidget *parent)
    : QDialog(parent), m_haupt(&hauptfenster)
{
    setObjectName(QStringLiteral("FormInfo"));
    setWindowTitle(QStringLiteral("PRADILON 1.00"));
    setAttribute(Qt::WA_DeleteOnClose);
    QPalette schwarz = palette();
    schwarz.setColor(QPalette::Window, Qt::black);
    setPalette(schwarz);
    setAutoFillBackground(true);

    auto *label1 = beschriftung(this, QStringLiteral("Label1"), QStringLiteral("PRADILON 1.00"), Qt::red, 24, true);
    label1->setAlignment(Qt::AlignCenter);
    auto *label2 = beschriftung(this, QStringLiteral("Label2"),
                                QStringLiteral("Programm zur rechnerunterstützten Erstellung eines Ministrantenplans"),
                                Qt::cyan, 0, false);
    auto *label3 =
        beschriftung(this, QStringLiteral("Label3"), QStringLiteral("Version 1.00, Stand: Mai 2002"), Qt::cyan, 0, false);
    auto *copyright = beschriftung(this, QStringLiteral("LabCopyright"),
                                   QStringLiteral("Pradilon-Team der Pfarrei\n© 2002 – alle Rechte vorbehalten"),
                                   Qt::cyan, 0, false);
    m_cmdOK = new QPushButton(QStringLiteral("OK"), this);
    m_cmdOK->setObjectName(QStringLiteral("CmdOK"));
    m_cmdOK->setDefault(true);
    m_cmdOK->setMinimumWidth(113);   // 1695 twips
    connect(m_cmdOK, &QPushButton::clicked, this, &QWidget::close);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(20, 20, 20, 12);
    layout->setSpacing(10);
    layout->addWidget(label1);
    layout->addWidget(label2);
    layout->addWidget(label3);
    layout->addSpacing(6);
    layout->addWidget(copyright);
    layout->addStretch(1);
    layout->addWidget(m_cmdOK, 0, Qt::AlignHCenter);
    setMinimumWidth(429);   // 6435 twips

    adjustSize();
    if (QScreen *bildschirm = QGuiApplication::primaryScreen()) {
        const QRect f = bildschirm->availableGeometry();
        move(f.x() + (f.width() - width()) / 2, f.y() + (f.height() - height()) / 2);
    }

    if (!m_haupt->isVisible()) {
        hilfe.setzeDatei(HilfeDateiPfad(programmOrdner));
        m_haupt->show();
    }
}

void FormInfo::closeEvent(QCloseEvent *event)
{
    QDialog::closeEvent(event);
    FormUnload();
}

void FormInfo::hideEvent(QHideEvent *event)
{
    // Escape hides a dialog without a close event.
    QDialog::hideEvent(event);
    if (!event->spontaneous())
        FormUnload();
}

void FormInfo::FormUnload()
{
    if (m_entladen)
        return;
    m_entladen = true;
    m_cmdOK->setEnabled(false);
    // Enabling the main window is left to whoever disabled it: the info window of the start
    // disabled nothing and may close while another secondary window keeps the main window off.
    if (m_haupt)
        m_haupt->show();
}
