"""The tour through the wizard of any medium."""
