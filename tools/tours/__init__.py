"""The ways on which the tour leads through any medium's wizard."""
