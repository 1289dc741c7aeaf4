#include "ui/QtMeldungen.h"

#include <QApplication>
#include <QMessageBox>
#include <QPushButton>

#include <utility>
#include <vector>

namespace {

QMessageBox::Icon qtSymbol(Symbol symbol)
{
    switch (symbol) {
    case Symbol::Kritisch:
        return QMessageBox::Critical;
    case Symbol::Ausrufezeichen:
        return QMessageBox::Warning;
    case Symbol::Information:
        return QMessageBox::Information;
    case Symbol::Keins:
        break;
    }
    return QMessageBox::NoIcon;
}

std::vector<Antwort> antworten(Knoepfe knoepfe)
{
    switch (knoepfe) {
    case Knoepfe::OK:
        return {Antwort::OK};
    case Knoepfe::OKAbbrechen:
        return {Antwort::OK, Antwort::Abbrechen};
    case Knoepfe::JaNeinAbbrechen:
        return {Antwort::Ja, Antwort::Nein, Antwort::Abbrechen};
    case Knoepfe::JaNein:
        return {Antwort::Ja, Antwort::Nein};
    }
    return {Antwort::OK};
}

std::pair<QString, QMessageBox::ButtonRole> beschriftung(Antwort a)
{
    switch (a) {
    case Antwort::OK:
        return {QStringLiteral("OK"), QMessageBox::AcceptRole};
    case Antwort::Abbrechen:
        return {QStringLiteral("Abbrechen"), QMessageBox::RejectRole};
    case Antwort::Ja:
        return {QStringLiteral("Ja"), QMessageBox::YesRole};
    case Antwort::Nein:
        return {QStringLiteral("Nein"), QMessageBox::NoRole};
    }
    return {QStringLiteral("OK"), QMessageBox::AcceptRole};
}

} // namespace

Antwort QtMeldungen::zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel)
{
    // A box parented to a disabled window would be disabled too, so a disabled active window
    // is not taken as parent.
    QWidget *eltern = QApplication::activeWindow();
    if (eltern && !eltern->isEnabled())
        eltern = nullptr;

    QMessageBox box(qtSymbol(symbol), titel, text, QMessageBox::NoButton, eltern);
    box.setWindowModality(Qt::ApplicationModal);
    const std::vector<Antwort> moeglich = antworten(knoepfe);
    std::vector<QPushButton *> knoepfeQt;
    for (Antwort a : moeglich) {
        auto [beschr, rolle] = beschriftung(a);
        knoepfeQt.push_back(box.addButton(beschr, rolle));
    }
    box.setDefaultButton(knoepfeQt.front());
    box.exec();

    for (size_t i = 0; i < knoepfeQt.size(); ++i) {
        if (box.clickedButton() == knoepfeQt[i])
            return moeglich[i];
    }
    // Closed without a button: the answer that changes nothing.
    return moeglich.size() == 1 ? moeglich.front() : moeglich.back();
}
