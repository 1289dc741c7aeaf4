#pragma once

#include <QDateTime>

// The clock, behind an interface so that tests fix "today" and the random seed.
class Uhr
{
public:
    virtual ~Uhr() = default;
    virtual QDateTime jetzt() const = 0;
};

class SystemUhr : public Uhr
{
public:
    QDateTime jetzt() const override { return QDateTime::currentDateTime(); }
};
