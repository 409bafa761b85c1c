"""A screen that cannot start one of its threads does not open, and says why: refused_thread_test.py LIBRARY FIRST_SCREEN"""

import os
import subprocess
import sys

library, program = sys.argv[1:]
for display, threads in (("headless", 1), ("browser", 3)):
    for refused in range(1, threads + 1):
        told = {"LD_PRELOAD": library, "BRIMOL_REFUSED_THREAD": str(refused), "BRIMOL_DISPLAY": display,
                "BRIMOL_LISTEN": "127.0.0.1:0"}
        run = subprocess.run([program], env=os.environ | told, stderr=subprocess.PIPE, text=True, timeout=60)
        last = run.stderr.splitlines()[-1:]
        if run.returncode != 1 or not last or "a thread cannot be started" not in last[0]:
            sys.exit(f"{display}, thread {refused}: exit code {run.returncode}\n{run.stderr}")
