"""The parts of Tests/compare-builds."""
