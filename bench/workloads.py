"""What is measured, in the order of the table."""

import collections

Workload = collections.namedtuple("Workload", "name title calls")
Setting = collections.namedtuple("Setting", "title before after")

# The name of a workload in the programs, its title in tables, and the number of calls in a round if
# the table shows the time of one call.
WORKLOADS = (
    Workload("read", "read 51 MB of doubles, row-major", None),
    Workload("read_column_major", "read the same, column-major", None),
    Workload("read_gzip", "read the same, gzip", None),
    Workload("read_gzip_file", "read the same, the whole file gzip", None),
    Workload("read_small_files", "read a compressed file of 100 doubles", 1000),
    Workload("write", "write 51 MB of doubles, row-major", None),
    Workload("write_column_major", "write the same, column-major", None),
    Workload("write_gzip", "write the same, gzip", None),
    Workload("walk_metadata", "walk 500 variables with 20 attributes each", None),
    Workload("write_metadata", "write 500 variables with 20 attributes each", None),
    Workload("read_values", 'read 100,000 values by "getVarData"', 100_000),
    Workload("read_values_hyper", 'read 100,000 values by "hyperGetVarData"', 100_000),
    Workload("read_text", "read 100,000 texts of 32 characters", None),
    Workload("write_text", "write 100,000 texts of 32 characters", None),
    Workload("widen", "widen characters, against memcpy of the same traffic", None),
    Workload("narrow", "narrow characters, likewise", None),
    Workload("read_strided", "read every second value of 2000 images, each way", None),
    Workload("epoch_breakdown", "break 1,000,000 epochs down", None),
    Workload("epoch_compute", "compute 1,000,000 epochs", None),
    Workload("epoch16_breakdown", "break 1,000,000 epoch16s down", None),
    Workload("epoch16_compute", "compute 1,000,000 epoch16s", None),
    Workload("get_constant", 'call "getConstantValue"', 20_000),
    Workload("unknown_command", "call an unknown command", 20_000),
    Workload("refused_argument", "have an argument refused", 20_000),
    Workload("library_failure", "have the library fail", 20_000),
)

# What users can set: the workload without and with it.
SETTINGS = (
    Setting("read-only mode, for a metadata walk", "walk_metadata", "walk_metadata_read_only"),
    Setting("CDF cache of 2 buffers, for the same walk", "walk_metadata", "walk_metadata_cache_2"),
    Setting("validation off, to open and close 500 variables", "open_close",
            "open_close_unvalidated"),
    Setting("CDF cache of 2 buffers, for a strided read", "read_strided", "read_strided_cache_2"),
    Setting("blocking factor 100, for single values of a gzip variable in random order",
            "read_values_gzip", "read_values_gzip_100"),
    Setting("MD5 checksum, reading 51 MB", "read", "read_checksum"),
    Setting("MD5 checksum, writing 51 MB", "write", "write_checksum"),
)
