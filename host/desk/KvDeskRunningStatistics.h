// SPDX-License-Identifier: MIT
#pragma once

/**
 * Mean, spread and extremes of numbers that come one by one.
 *
 * Sums are kept about the mean, so that numbers far from 0 that hardly differ lose no digits. What is not a
 * finite number is only counted.
 */
class KvDeskRunningStatistics
{
public:
    void add(double number);
    /** As if all numbers of \a other had been added. */
    void add(const KvDeskRunningStatistics &other);

    int count() const { return m_count; }     ///< finite numbers
    int leftOut() const { return m_leftOut; } ///< others

    /** These are NaN without numbers. */
    double mean() const;
    double minimum() const;
    double maximum() const;
    /** Of the numbers as a whole population (divided by their count), as reports state it; NaN for less than
     * two numbers. */
    double standardDeviation() const;

private:
    int m_count = 0;
    int m_leftOut = 0;
    double m_mean = 0.0;
    double m_squares = 0.0; ///< sum of the squared distances from the mean
    double m_minimum = 0.0;
    double m_maximum = 0.0;
};
