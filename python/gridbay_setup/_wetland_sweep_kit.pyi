from ._flow_model import *
