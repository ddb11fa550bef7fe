# SPDX-License-Identifier: MIT
"""How often a fault is brought about."""

import os


def fault_count(few, many):
    """`few` times with each run of all tests, `many` when HMI_FAULTS is "full"."""
    return many if os.environ.get("HMI_FAULTS") == "full" else few
