#include "ui/Werkzeugbilder.h"

#include <QImage>
#include <QPainter>
#include <QPainterPath>

namespace {

const QColor Schwarz(0, 0, 0);
const QColor Dunkelgrau(128, 128, 128);
const QColor Hellgrau(192, 192, 192);
const QColor Weiss(255, 255, 255);
const QColor Gelb(255, 255, 0);
const QColor Oliv(128, 128, 0);
const QColor Marine(0, 0, 128);
const QColor Gruen(0, 128, 0);
const QColor Blaugruen(0, 128, 128);

constexpr int Seite = 16;   // the picture itself, drawn in the middle of the button

void zeichneOeffnen(QPainter &p)
{
    // folder: back with tab, open front flap
    p.setPen(Schwarz);
    p.setBrush(Oliv);
    p.drawRect(0, 5, 11, 9);
    p.drawRect(1, 4, 4, 1);
    p.setBrush(Gelb);
    const QPoint klappe[] = {QPoint(0, 14), QPoint(3, 8), QPoint(15, 8), QPoint(12, 14)};
    p.drawPolygon(klappe, 4);
    // arrow bending from the folder to the upper right
    p.setPen(QPen(Schwarz, 1));
    p.setBrush(Qt::NoBrush);
    p.drawLine(8, 3, 9, 2);
    p.drawLine(9, 1, 12, 1);
    p.drawLine(13, 2, 13, 5);
    const QPoint spitze[] = {QPoint(11, 4), QPoint(15, 4), QPoint(13, 6)};
    p.setBrush(Schwarz);
    p.drawPolygon(spitze, 3);
}

void zeichneSpeichern(QPainter &p)
{
    p.setPen(Schwarz);
    p.setBrush(Marine);
    p.drawRect(1, 1, 13, 13);
    p.setBrush(Weiss);
    p.drawRect(3, 1, 9, 6);
    p.setPen(Hellgrau);
    p.drawLine(5, 3, 10, 3);
    p.drawLine(5, 5, 10, 5);
    p.setPen(Schwarz);
    p.setBrush(Hellgrau);
    p.drawRect(4, 9, 7, 5);
    p.fillRect(6, 10, 2, 3, Marine);
}

void zeichneDrucken(QPainter &p)
{
    p.setPen(Schwarz);
    p.setBrush(Weiss);
    p.drawRect(4, 0, 7, 6);
    p.setPen(Dunkelgrau);
    p.drawLine(6, 2, 9, 2);
    p.drawLine(6, 4, 9, 4);
    p.setPen(Schwarz);
    p.setBrush(Hellgrau);
    p.drawRect(0, 6, 15, 6);
    p.fillRect(12, 8, 2, 1, Gruen);
    p.drawLine(3, 10, 12, 10);
    p.setBrush(Weiss);
    p.drawRect(3, 12, 9, 3);
}

QPainterPath fragezeichen(qreal x, qreal y, qreal s)
{
    // a question mark in a box of s x 2s, top left at x, y
    QPainterPath pfad;
    pfad.moveTo(x, y + s * 0.5);
    pfad.arcTo(x, y, s, s, 180, -270);
    pfad.lineTo(x + s / 2, y + s * 1.4);
    return pfad;
}

void zeichneFrage(QPainter &p)
{
    p.setRenderHint(QPainter::Antialiasing, false);
    p.setPen(QPen(Marine, 2, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
    p.setBrush(Qt::NoBrush);
    p.drawPath(fragezeichen(4, 1, 7));
    p.fillRect(7, 13, 2, 2, Marine);
}

void zeichneBlatt(QPainter &p)
{
    p.setPen(Schwarz);
    p.setBrush(Weiss);
    const QPoint blatt[] = {QPoint(2, 0), QPoint(10, 0), QPoint(13, 3), QPoint(13, 15), QPoint(2, 15)};
    p.drawPolygon(blatt, 5);
    p.drawLine(10, 0, 10, 3);
    p.drawLine(10, 3, 13, 3);
}

void zeichneHilfe(QPainter &p)
{
    // mouse pointer
    const QPoint pfeil[] = {QPoint(0, 0), QPoint(0, 11), QPoint(3, 8), QPoint(5, 13),
                            QPoint(7, 12), QPoint(5, 7), QPoint(9, 7)};
    p.setPen(Schwarz);
    p.setBrush(Weiss);
    p.drawPolygon(pfeil, 7);
    // question mark beside it
    p.setPen(QPen(Blaugruen, 2, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
    p.setBrush(Qt::NoBrush);
    p.drawPath(fragezeichen(10, 1, 4));
    p.fillRect(11, 9, 2, 2, Blaugruen);
}

QImage motivBild(Motiv motiv)
{
    QImage bild(Seite, Seite, QImage::Format_ARGB32);
    bild.fill(Qt::transparent);
    QPainter p(&bild);
    switch (motiv) {
    case Motiv::Oeffnen: zeichneOeffnen(p); break;
    case Motiv::Speichern: zeichneSpeichern(p); break;
    case Motiv::Drucken: zeichneDrucken(p); break;
    case Motiv::Frage: zeichneFrage(p); break;
    case Motiv::Blatt: zeichneBlatt(p); break;
    case Motiv::Hilfe: zeichneHilfe(p); break;
    }
    return bild;
}

// The greyed look: the dark lines of the picture in grey with a white shadow one pixel down and
// right; light fillings vanish into the button face.
bool dunkel(QRgb farbe)
{
    return qAlpha(farbe) >= 128 && qGray(farbe) < 160;
}

QImage ausgegraut(const QImage &bild)
{
    QImage ergebnis(bild.size(), QImage::Format_ARGB32);
    ergebnis.fill(Qt::transparent);
    for (int y = 0; y < bild.height(); ++y) {
        for (int x = 0; x < bild.width(); ++x) {
            if (!dunkel(bild.pixel(x, y)))
                continue;
            if (x + 1 < bild.width() && y + 1 < bild.height())
                ergebnis.setPixelColor(x + 1, y + 1, Weiss);
        }
    }
    for (int y = 0; y < bild.height(); ++y) {
        for (int x = 0; x < bild.width(); ++x) {
            if (dunkel(bild.pixel(x, y)))
                ergebnis.setPixelColor(x, y, Dunkelgrau);
        }
    }
    return ergebnis;
}

void zeichneRand(QPainter &p, bool erhaben)
{
    const int r = BildBreite - 1;
    const int u = BildHoehe - 1;
    p.fillRect(0, 0, BildBreite, BildHoehe, Hellgrau);
    const QColor hell = erhaben ? Weiss : Schwarz;
    const QColor dunkel = erhaben ? Schwarz : Weiss;
    p.setPen(hell);
    p.drawLine(0, 0, r - 1, 0);
    p.drawLine(0, 0, 0, u - 1);
    p.setPen(dunkel);
    p.drawLine(0, u, r, u);
    p.drawLine(r, 0, r, u);
    p.setPen(Dunkelgrau);
    if (erhaben) {
        p.drawLine(1, u - 1, r - 1, u - 1);
        p.drawLine(r - 1, 1, r - 1, u - 1);
    } else {
        p.drawLine(1, 1, r - 1, 1);
        p.drawLine(1, 1, 1, u - 1);
    }
}

} // namespace

QPixmap Werkzeugbild(Motiv motiv, Bildzustand zustand)
{
    QImage knopf(BildBreite, BildHoehe, QImage::Format_ARGB32);
    QPainter p(&knopf);
    zeichneRand(p, zustand != Bildzustand::Down);
    QImage bild = motivBild(motiv);
    if (zustand == Bildzustand::Dis)
        bild = ausgegraut(bild);
    // pressed: the picture moves one pixel down and right, as a pressed button does
    const int versatz = zustand == Bildzustand::Down ? 1 : 0;
    p.drawImage((BildBreite - Seite) / 2 + versatz, (BildHoehe - Seite) / 2 + versatz, bild);
    p.end();
    return QPixmap::fromImage(knopf);
}
