#include "ui/Werkzeugknopf.h"

#include <QMouseEvent>

void Bild::mouseReleaseEvent(QMouseEvent *event)
{
    QLabel::mouseReleaseEvent(event);
    if (event->button() == Qt::LeftButton && rect().contains(event->position().toPoint()))
        emit clicked();
}

namespace {

Bild *neuesBild(QWidget *eltern, const QString &name, Motiv motiv, Bildzustand zustand)
{
    auto *bild = new Bild(eltern);
    bild->setObjectName(name);
    bild->setPixmap(Werkzeugbild(motiv, zustand));
    bild->setGeometry(0, 0, BildBreite, BildHoehe);
    return bild;
}

} // namespace

Werkzeugknopf::Werkzeugknopf(const QString &name, Motiv motiv, const QString &tooltip, bool mitDisBild,
                             QWidget *parent)
    : QWidget(parent),
      m_up(neuesBild(this, QStringLiteral("Im%1Up").arg(name), motiv, Bildzustand::Up)),
      m_down(neuesBild(this, QStringLiteral("Im%1Down").arg(name), motiv, Bildzustand::Down))
{
    setObjectName(QStringLiteral("Knopf%1").arg(name));
    setFixedSize(BildBreite, BildHoehe);
    if (mitDisBild)
        m_dis = neuesBild(this, QStringLiteral("Im%1Dis").arg(name), motiv, Bildzustand::Dis);
    m_up->setToolTip(tooltip);
    connect(m_up, &Bild::clicked, this, &Werkzeugknopf::geklickt);
    zeigeBild();
}

void Werkzeugknopf::setzeVerfuegbar(bool verfuegbar)
{
    m_verfuegbar = verfuegbar;
    zeigeBild();
}

void Werkzeugknopf::setzeGedrueckt(bool gedrueckt)
{
    m_gedrueckt = gedrueckt;
    zeigeBild();
}

void Werkzeugknopf::zeigeBild()
{
    const bool dis = !m_gedrueckt && !m_verfuegbar && m_dis;
    const bool up = !m_gedrueckt && !dis;
    m_up->setVisible(up);
    m_down->setVisible(m_gedrueckt);
    if (m_dis)
        m_dis->setVisible(dis);
}
