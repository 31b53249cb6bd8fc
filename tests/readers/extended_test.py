"""CDF_TIME_TT2000 as calendar times, against independent readers."""

import random
import unittest

import cdflib
import numpy as np
import pycdfpp

from readers.case import ReadersCase
from support.ambrix_session import array

FIRST, LAST = -2 ** 63 + 4, 2 ** 63 - 1
IN_1960, IN_1972 = -1262347166871870000, -883655957816000000  # 1 January of both
SECOND = 10 ** 9
# The first days of new offsets between UTC and atomic time; from 1972 on, after a leap second.
STEPS = ((1961, 1, 1), (1961, 8, 1), (1962, 1, 1), (1963, 11, 1), (1964, 1, 1), (1964, 4, 1),
         (1964, 9, 1), (1965, 1, 1), (1965, 3, 1), (1965, 7, 1), (1965, 9, 1), (1966, 1, 1),
         (1968, 2, 1), (1972, 1, 1))
LEAPS = ((1972, 7, 1), (1973, 1, 1), (1981, 7, 1), (1999, 1, 1), (2006, 1, 1), (2015, 7, 1),
         (2017, 1, 1))


class TimesTest(ReadersCase):
    def computed(self, times):
        flat = [float(component) for time in times for component in time]
        (values,) = self.session.call("computeTT2000", array("double", flat, [9, len(times)]))
        return values.data

    def broken_down(self, values):
        (times,) = self.session.call("tt2000Breakdown", array("int64", list(values)))
        return np.array(times.data, int).reshape(-1, 9).tolist()

    def random_values(self, first, last, count=4000):
        generator = random.Random(first)
        return [first, last, *(generator.randint(first, last) for _ in range(count))]

    def around(self, dates):
        midnights = self.computed([(*date, 0, 0, 0, 0, 0, 0) for date in dates])
        offsets = (-SECOND, -SECOND // 2, -1, 0, 1, SECOND)
        return [midnight + offset for midnight in midnights for offset in offsets]

    def test_cdflib_breaks_down_and_computes_alike(self):
        for first, last in ((FIRST, IN_1960), (IN_1960, IN_1972 - 2 * SECOND), (IN_1972, LAST)):
            values = self.random_values(first, last)
            times = self.broken_down(values)
            theirs = cdflib.cdfepoch.breakdown_tt2000(np.array(values, np.int64))
            self.assertEqual(times, np.asarray(theirs).astype(int).tolist())
            self.assertEqual(self.computed(times), values)
            self.assertEqual(np.asarray(cdflib.cdfepoch.compute_tt2000(np.array(times))).tolist(),
                             values)

    def test_cdflib_knows_the_same_leap_seconds(self):
        values = self.around(LEAPS[1:])  # it takes the first one for no leap second
        times = self.broken_down(values)
        theirs = cdflib.cdfepoch.breakdown_tt2000(np.array(values, np.int64))
        self.assertEqual(times, np.asarray(theirs).astype(int).tolist())
        self.assertEqual(sum(time[5] == 60 for time in times), 3 * len(LEAPS[1:]))
        self.assertEqual(self.computed(times), values)

    def test_the_first_leap_second_is_one(self):
        (midnight,) = self.computed([(1972, 7, 1, 0, 0, 0, 0, 0, 0)])
        self.assertEqual(self.broken_down([midnight - 1]),
                         [[1972, 6, 30, 23, 59, 60, 999, 999, 999]])

    def test_pycdfpp_breaks_down_alike(self):
        """Also before 1972; its times have no leap seconds and end in 2262."""
        compared = 0
        values = self.random_values(FIRST, LAST) + self.random_values(IN_1960, IN_1972)
        values += self.around(STEPS + LEAPS)
        for value, time in zip(values, self.broken_down(values)):
            theirs = pycdfpp.to_datetime64(pycdfpp.tt2000_t(value))
            if time[5] == 60 or np.isnat(theirs):
                continue
            text = "{:04}-{:02}-{:02}T{:02}:{:02}:{:02}.{:03}{:03}{:03}".format(*time)
            self.assertEqual(theirs, np.datetime64(text, "ns"), value)
            compared += 1
        self.assertGreater(compared, 7900)

    def test_before_a_step_in_the_1960s_a_part_of_the_next_day_comes_twice(self):
        """As in the library: cdflib keeps the offset of the day that ends."""
        for date in STEPS[-1:] + STEPS[5:12]:
            (midnight,) = self.computed([(*date, 0, 0, 0, 0, 0, 0)])
            (time,) = self.broken_down([midnight - 1])
            self.assertEqual(tuple(time[:6]), (*date, 0, 0, 0))
            self.assertGreater(self.computed([time])[0], midnight)

    def test_fill_and_pad_values(self):
        fill, pad = -2 ** 63, -2 ** 63 + 1
        times = self.broken_down([fill, pad])
        theirs = cdflib.cdfepoch.breakdown_tt2000(np.array([fill, pad], np.int64))
        self.assertEqual(times[0], np.asarray(theirs).astype(int).tolist()[0])
        self.assertEqual(times, [[9999, 12, 31, 23, 59, 59, 999, 999, 999],
                                 [0, 1, 1, 0, 0, 0, 0, 0, 0]])
        self.assertEqual(self.computed(times), [fill, pad])


if __name__ == "__main__":
    unittest.main()
