#include "Programme.h"

#include <QFile>
#include <QProcess>

Lauf Starte(const QString &programm, const QStringList &argumente, const QString &ordner)
{
    QProcess p;
    if (!ordner.isEmpty())
        p.setWorkingDirectory(ordner);
    p.start(programm, argumente);
    Lauf l;
    if (!p.waitForFinished(60000) || p.exitStatus() != QProcess::NormalExit)
        return l;
    l.code = p.exitCode();
    l.aus = QString::fromUtf8(p.readAllStandardOutput());
    l.fehler = QString::fromUtf8(p.readAllStandardError());
    return l;
}

QByteArray LiesDatei(const QString &pfad)
{
    QFile f(pfad);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}

bool SchreibeBytes(const QString &pfad, const QByteArray &inhalt)
{
    QFile f(pfad);
    return f.open(QIODevice::WriteOnly) && f.write(inhalt) == inhalt.size();
}
