"""How long pandas or pyarrow take to read a CSV file, and how much memory."""
import resource
import sys
import time

import pandas
from pyarrow import csv, set_cpu_count

reader, path = sys.argv[1:]
set_cpu_count(1)
begin = time.process_time()
table = pandas.read_csv(path) if reader == "pandas" else csv.read_csv(path)
seconds = time.process_time() - begin
rows = len(table)
peak = resource.getrusage(resource.RUSAGE_SELF).ru_maxrss * 1024
print(f"{reader + '.read_csv':28}{seconds:8.2f} s{1e6 * seconds / rows:8.2f} us{peak / rows:8.0f} bytes a patch")
