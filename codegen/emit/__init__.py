"""Emitters: each turns the model into the text of one kind of output."""
