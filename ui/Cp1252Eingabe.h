#pragma once

#include <QValidator>

class QComboBox;
class QLineEdit;

// Refuses, when typed or pasted, every character that has no byte in Windows-1252, so each
// text can be written to the data file and the text exports. Control characters are refused
// too: a line break inside a field would shift every later line of the data file.
class Cp1252Eingabe : public QValidator
{
    Q_OBJECT
public:
    using QValidator::QValidator;

    State validate(QString &eingabe, int &position) const override;

    static bool IstErlaubt(QChar zeichen);
};

void NurCp1252(QLineEdit *feld);
void NurCp1252(QComboBox *liste);
