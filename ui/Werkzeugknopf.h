#pragma once

#include "ui/Werkzeugbilder.h"

#include <QLabel>
#include <QWidget>

// An image that reports a click (the left button released over it).
class Bild : public QLabel
{
    Q_OBJECT
public:
    using QLabel::QLabel;

signals:
    void clicked();

protected:
    void mouseReleaseEvent(QMouseEvent *event) override;
};

// One toolbar button: the images Im<name>Up, Im<name>Down and Im<name>Dis stacked on one spot,
// exactly one of them visible. Only the Up image reacts to a click. "Down" is shown while the
// window or action the button started is open; releasing it shows Up or Dis again, whichever
// the button's availability says.
class Werkzeugknopf : public QWidget
{
    Q_OBJECT
public:
    Werkzeugknopf(const QString &name, Motiv motiv, const QString &tooltip, bool mitDisBild, QWidget *parent);

    void setzeVerfuegbar(bool verfuegbar);
    void setzeGedrueckt(bool gedrueckt);
    bool gedrueckt() const { return m_gedrueckt; }

signals:
    void geklickt();

private:
    void zeigeBild();

    Bild *m_up;
    Bild *m_down;
    Bild *m_dis = nullptr;
    bool m_verfuegbar = true;
    bool m_gedrueckt = false;
};
