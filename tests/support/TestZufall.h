#pragma once

#include "plan/Zufall.h"

#include <deque>
#include <stdexcept>

// Hands out exactly the numbers it was given; running out is a test failure.
class TestZufall : public Zufall
{
public:
    TestZufall() = default;
    TestZufall(std::initializer_list<double> werte) : m_werte(werte) {}

    void starte(uint32_t startwert) override { ++m_starts; m_letzterStartwert = startwert; }
    double naechste() override
    {
        if (m_werte.empty())
            throw std::logic_error("TestZufall: no scripted number left");
        double w = m_werte.front();
        m_werte.pop_front();
        return w;
    }
    void dazu(double w) { m_werte.push_back(w); }
    int starts() const { return m_starts; }
    uint32_t letzterStartwert() const { return m_letzterStartwert; }
    size_t uebrig() const { return m_werte.size(); }

private:
    std::deque<double> m_werte;
    int m_starts = 0;
    uint32_t m_letzterStartwert = 0;
};
