#pragma once

#include <QByteArray>
#include <QString>

// Windows-1252, the code page of every text file the program writes, with a table of our own
// (0x80-0x9F differ from Latin-1). The five bytes the code page leaves undefined (0x81, 0x8D,
// 0x8F, 0x90, 0x9D) map to the control characters of the same value, so reading and writing a
// file gives back every byte unchanged.

QString DekodiereCp1252(const char *daten, qsizetype laenge);
inline QString DekodiereCp1252(const QByteArray &daten) { return DekodiereCp1252(daten.constData(), daten.size()); }

// Appends the bytes of text to ziel. Returns false (and leaves ziel partly extended) when text holds
// a character the code page cannot represent.
[[nodiscard]] bool KodiereCp1252(const QString &text, QByteArray &ziel);

// Whether every character of text can be written.
bool IstCp1252(const QString &text);
bool IstCp1252(QChar zeichen);
