#pragma once

#include "data/Uhr.h"

class TestUhr : public Uhr
{
public:
    explicit TestUhr(QDateTime t = QDateTime(QDate(2026, 12, 5), QTime(9, 30, 0))) : m_t(t) {}
    QDateTime jetzt() const override { return m_t; }
    void setze(const QDateTime &t) { m_t = t; }

private:
    QDateTime m_t;
};
