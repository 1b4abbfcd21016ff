"""What the classes that are made in C++ are given when the package is imported."""

from PyQt6 import sip

from zandor import TalvikZandorLib, _zandor


def give_properties(cls: type) -> None:
    """Makes the properties of a class call its getters and setters as methods. SIP 6.7 calls them
    without an object, which they do not bear."""
    for name in dir(cls):
        declared = getattr(cls, name, None)
        if isinstance(declared, property):
            getter, setter = getattr(cls, "_" + name), getattr(cls, "_set" + name, None)
            setattr(cls, name, property(getter, setter, doc=declared.__doc__))


for _cls in vars(_zandor).copy().values():
    if isinstance(_cls, type) and _cls.__module__ == _zandor.__name__:
        give_properties(_cls)

# The ready-made collections are walked as those of a program's own are.
for _name in ("__len__", "__iter__", "__getitem__", "__contains__"):
    setattr(_zandor.Items, _name, getattr(TalvikZandorLib.Collection, _name))


def _take_leave(widget: _zandor.ZandorWidget) -> None:
    """Ends the control while its model and its library are whole: what goes together in a circle,
    the collector takes apart in any order."""
    if not sip.isdeleted(widget):
        sip.delete(widget)


setattr(_zandor.ZandorWidget, "__del__", _take_leave)
