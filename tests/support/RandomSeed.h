#pragma once

#include <QTest>
#include <QtGlobal>
#include <cstdio>

// The seed of a test function that plays at random. It is the usual one of the test unless TITLER_SEED is
// set, which repeats a run or tries another. A test function that fails says with which seed.
class RandomSeed
{
public:
    explicit RandomSeed(quint32 usual) : m_value(usual)
    {
        bool isNumber = false;
        const quint32 wanted = qEnvironmentVariable("TITLER_SEED").toUInt(&isNumber);
        if (isNumber)
            m_value = wanted;
    }
    ~RandomSeed()
    {
        if (QTest::currentTestFailed())
            std::fprintf(stderr, "TITLER_SEED=%u repeats this run\n", m_value);
    }
    Q_DISABLE_COPY(RandomSeed)

    operator quint32() const { return m_value; }

private:
    quint32 m_value;
};

// Returns how long a test plays at random: the value of the variable if that is a positive number, else the
// usual one.
inline int runLength(const char* variable, int usual)
{
    bool isNumber = false;
    const int wanted = qEnvironmentVariableIntValue(variable, &isNumber);
    return isNumber && wanted > 0 ? wanted : usual;
}
