"""Uses a program on a screen from outside its process, as a person does."""
