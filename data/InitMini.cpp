#include "data/InitMini.h"

#include <QDir>

QString StandardDateiname()
{
#ifdef Q_OS_WIN
    return QStringLiteral("\\pradilon.prd");
#else
    return QDir::toNativeSeparators(QDir::homePath() + QStringLiteral("/pradilon.prd"));
#endif
}

InitMini::InitMini()
    : Wochentag{QString(), QStringLiteral("Sonntag"), QStringLiteral("Montag"), QStringLiteral("Dienstag"),
                QStringLiteral("Mittwoch"), QStringLiteral("Donnerstag"), QStringLiteral("Freitag"),
                QStringLiteral("Samstag")},
      Dateiname(StandardDateiname())
{
}
