"""usage: peer_column.py PACKAGE FOLDER DIVISOR [--list]

The workloads that another reader of CDF files can do, in the way that its documentation shows."""

import pathlib
import sys
import time

EPOCH = 63113904000000.0
TEXT = "a text of some length, such as units"


class Peer:
    """What the columns of all packages share: the amounts of bench/setup.h."""

    def __init__(self, folder, divisor):
        self.folder = pathlib.Path(folder)
        self.records = 6400 // divisor
        self.variables = 500 // divisor
        self.singles = 100_000 // divisor
        self.times = 1_000_000 // divisor

    def file(self, name):
        return str(self.folder / name)

    def new_file(self):
        path = self.folder / "peer_written.cdf"
        path.unlink(missing_ok=True)
        return str(path)

    def numbers(self):
        import numpy
        return numpy.arange(self.records * 1000.0).reshape(self.records, 100, 10)


class SpacePy(Peer):
    def __init__(self, *arguments):
        super().__init__(*arguments)
        import spacepy.pycdf
        self.pycdf = spacepy.pycdf

    def read(self, name="row.cdf", variable="values"):
        with self.pycdf.CDF(self.file(name)) as file:
            return file[variable][...]

    def read_column_major(self):
        return self.read("column.cdf")

    def read_gzip(self):
        return self.read("gzip.cdf")

    def read_gzip_file(self):
        return self.read("gzip_file.cdf")

    def read_text(self):
        return self.read("text.cdf", "text")

    def read_strided(self):
        with self.pycdf.CDF(self.file("image.cdf")) as file:
            return file["image"][:, ::2, ::2]

    def read_values(self):
        with self.pycdf.CDF(self.file("series.cdf")) as file:
            series = file["series"]
            return sum(series[i] for i in range(self.singles))

    def walk_metadata(self):
        with self.pycdf.CDF(self.file("metadata.cdf")) as file:
            return {name: dict(variable.attrs) for name, variable in file.items()}

    def write(self, compress=None):
        values = self.numbers()
        start = time.perf_counter()
        with self.pycdf.CDF(self.new_file(), "") as file:
            file.new("values", data=values, type=self.pycdf.const.CDF_REAL8, compress=compress)
        return start

    def write_gzip(self):
        return self.write(self.pycdf.const.GZIP_COMPRESSION)

    def write_metadata(self):
        start = time.perf_counter()
        with self.pycdf.CDF(self.new_file(), "") as file:
            for number in range(self.variables):
                variable = file.new(f"variable{number}", type=self.pycdf.const.CDF_REAL8)
                for i in range(20):
                    variable.attrs[f"attribute{i}"] = 1.5 if i % 2 else TEXT
        return start

    def epoch_breakdown(self):
        epochs = [EPOCH] * self.times
        start = time.perf_counter()
        self.pycdf.lib.v_epoch_to_datetime(epochs)
        return start


class Pycdfpp(Peer):
    def __init__(self, *arguments):
        super().__init__(*arguments)
        import pycdfpp
        self.pycdfpp = pycdfpp

    def read(self, name="row.cdf", variable="values"):
        return self.pycdfpp.load(self.file(name))[variable].values

    def read_column_major(self):
        return self.read("column.cdf")

    def read_gzip(self):
        return self.read("gzip.cdf")

    def read_gzip_file(self):
        return self.read("gzip_file.cdf")

    def read_text(self):
        return self.pycdfpp.load(self.file("text.cdf"))["text"].values_encoded

    def read_values(self):
        values = self.read("series.cdf", "series")
        return sum(values[i] for i in range(self.singles))

    def walk_metadata(self):
        file = self.pycdfpp.load(self.file("metadata.cdf"))
        return {name: {key: attribute[0] for key, attribute in variable.attributes.items()}
                for name, variable in file.items()}

    def write(self, compression=None):
        values = self.numbers()
        start = time.perf_counter()
        file = self.pycdfpp.CDF()
        given = {} if compression is None else {"compression": compression}
        file.add_variable("values", values=values, **given)
        self.pycdfpp.save(file, self.new_file())
        return start

    def write_gzip(self):
        return self.write(self.pycdfpp.CompressionType.gzip_compression)

    def write_metadata(self):
        import numpy
        start = time.perf_counter()
        file = self.pycdfpp.CDF()
        for number in range(self.variables):
            attributes = {f"attribute{i}": [1.5] if i % 2 else TEXT for i in range(20)}
            file.add_variable(f"variable{number}", values=numpy.zeros(1), attributes=attributes)
        self.pycdfpp.save(file, self.new_file())
        return start


class Cdflib(Peer):
    """Text is left out: 100,000 values take minutes."""

    def __init__(self, *arguments):
        super().__init__(*arguments)
        import cdflib
        import cdflib.cdfwrite
        self.cdflib = cdflib

    def read(self, name="row.cdf", variable="values"):
        return self.cdflib.CDF(self.file(name)).varget(variable)

    def read_column_major(self):
        return self.read("column.cdf")

    def read_gzip(self):
        return self.read("gzip.cdf")

    def read_gzip_file(self):
        return self.read("gzip_file.cdf")

    def walk_metadata(self):
        file = self.cdflib.CDF(self.file("metadata.cdf"))
        return {name: file.varattsget(name) for name in file.cdf_info().zVariables}

    def write(self, compress=0):
        values = self.numbers()
        start = time.perf_counter()
        file = self.cdflib.cdfwrite.CDF(self.new_file())
        file.write_var({"Variable": "values", "Data_Type": 45, "Num_Elements": 1, "Rec_Vary": True,
                        "Dim_Sizes": [100, 10], "Compress": compress}, var_data=values)
        file.close()
        return start

    def write_gzip(self):
        return self.write(6)

    def write_metadata(self):
        start = time.perf_counter()
        file = self.cdflib.cdfwrite.CDF(self.new_file())
        for number in range(self.variables):
            attributes = {f"attribute{i}": [1.5, "CDF_DOUBLE"] if i % 2 else TEXT
                          for i in range(20)}
            file.write_var({"Variable": f"variable{number}", "Data_Type": 45, "Num_Elements": 1,
                            "Rec_Vary": True, "Dim_Sizes": []}, var_attrs=attributes)
        file.close()
        return start

    def epoch_breakdown(self):
        import numpy
        epochs = numpy.full(self.times, EPOCH)
        start = time.perf_counter()
        self.cdflib.cdfepoch.breakdown_epoch(epochs)
        return start


PEERS = {"spacepy": SpacePy, "pycdfpp": Pycdfpp, "cdflib": Cdflib}


def seconds_of(work):
    """What a workload returns is kept until the clock has stopped; a number is when to start it."""
    start = time.perf_counter()
    result = work()
    end = time.perf_counter()
    return end - (result if isinstance(result, float) and start < result < end else start)


def main(package, folder, divisor, *options):
    try:
        peer = PEERS[package](folder, int(divisor))
    except ImportError as error:
        print(error, file=sys.stderr)
        return 1
    if options:
        shared = set(dir(Peer))
        print(*(name for name in dir(peer) if name not in shared and callable(getattr(peer, name))))
        return 0
    print("ready", flush=True)
    for line in sys.stdin:
        print(seconds_of(getattr(peer, line.strip())), flush=True)
    return 0


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
