#!/usr/bin/env python3
"""A test of the table of benchmarks: known times give known exponents, ratios and steps."""

import unittest

import table


def result(name, nanoseconds, **numbers):
    return {"family": "F", "name": name, "cpu_time": nanoseconds, "reference": 100.0, "iterations": 7} | numbers


class Tables(unittest.TestCase):
    def test_ratio_and_work(self):
        runs = [result("Find", time, roots=1.5, largest=9.0) for time in (50.0, 40.0, 900.0)]
        functions, _ = table.tables(runs, {"Find": {"curve cuts": 2, "passes": 0}})
        self.assertEqual([cell.strip() for cell in functions.splitlines()[2].split("|")[1:-1]],
                         ["F", "Find", "0.5", "50", "1.5 roots, 2 curve cuts"])

    def test_exponent(self):
        _, growth = table.tables([result(f"Fit/{10 ** k}", 3.0 * 10 ** (2 * k)) for k in range(2, 7)], {})
        self.assertIn("| 300 ", growth)
        self.assertIn("| 2.000 ± 0.000 |", growth)


if __name__ == "__main__":
    unittest.main()
