"""Puts the built package and the generator on the import path."""
import os
import sys

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
BUILD = os.path.join(ROOT, os.environ.get('OPENVORLA_BUILD', 'build'))
sys.path.insert(0, os.path.join(BUILD, 'python'))
sys.path.insert(0, ROOT)
