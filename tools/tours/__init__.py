"""The routes that the tour takes through the wizard of any medium."""
