#include "ui/Cp1252Eingabe.h"

#include "data/Cp1252.h"

#include <QComboBox>
#include <QLineEdit>

QValidator::State Cp1252Eingabe::validate(QString &eingabe, int &) const
{
    for (const QChar c : eingabe) {
        if (!IstErlaubt(c))
            return Invalid;
    }
    return Acceptable;
}

bool Cp1252Eingabe::IstErlaubt(QChar zeichen)
{
    const char16_t c = zeichen.unicode();
    if (c < 0x20 || c == 0x7F)
        return false;
    // The five bytes the code page leaves undefined decode to C1 controls: nothing to type.
    if (c == 0x81 || c == 0x8D || c == 0x8F || c == 0x90 || c == 0x9D)
        return false;
    return IstCp1252(zeichen);
}

void NurCp1252(QLineEdit *feld)
{
    feld->setValidator(new Cp1252Eingabe(feld));
}

void NurCp1252(QComboBox *liste)
{
    liste->setValidator(new Cp1252Eingabe(liste));
}
