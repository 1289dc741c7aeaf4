#pragma once

#include <cstdint>
#include <optional>
#include <random>

// Source of uniform numbers in [0, 1). The generator seeds it at the start of every computation;
// tests replace it with an exact sequence.
class Zufall
{
public:
    virtual ~Zufall() = default;
    virtual void starte(uint32_t startwert) = 0;
    virtual double naechste() = 0;
};

// Mersenne twister. With a fixed seed (command-line --seed) the clock's seed is ignored, so the
// same data and dates give the same plan.
class StandardZufall : public Zufall
{
public:
    StandardZufall() = default;
    explicit StandardZufall(uint32_t festerStartwert) : m_fest(festerStartwert) {}

    void starte(uint32_t startwert) override { m_gen.seed(m_fest ? *m_fest : startwert); }
    double naechste() override { return std::uniform_real_distribution<double>(0.0, 1.0)(m_gen); }

private:
    std::optional<uint32_t> m_fest;
    std::mt19937 m_gen;
};
