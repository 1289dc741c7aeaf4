#pragma once

#include <QByteArray>
#include <QString>
#include <QStringList>

struct Lauf {
    int code = -1;
    QString aus;     // standard output, UTF-8
    QString fehler;  // standard error, UTF-8
};

// Runs programm with the arguments in ordner and waits for it.
Lauf Starte(const QString &programm, const QStringList &argumente, const QString &ordner = QString());

QByteArray LiesDatei(const QString &pfad);
bool SchreibeBytes(const QString &pfad, const QByteArray &inhalt);
