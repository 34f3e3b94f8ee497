"""A data type, vectorData: three numbers, which the application can copy
and read from and write to scene files as text ("1 2.5 -3").

    vorla.round_trip_data('vectorData', '1 2.5 -3')   # -> ('1 2.5 -3', '1 2.5 -3')
"""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class VectorData(vpx.VPxData):
    type_name = 'vectorData'
    type_id = ov.VTypeId(0x7A103)

    def __init__(self):
        super().__init__()
        self.values = [0.0, 0.0, 0.0]

    def typeId(self):
        return VectorData.type_id

    def name(self):
        return VectorData.type_name

    def copy(self, source):
        # The application passes the other instance itself.
        self.values = list(source.values)

    def readASCII(self, args, last):
        # The words of the file are in args; this data's own start at the
        # index `last` holds, and `last` is left at the last word used. The
        # host passes it by reference: uIntPtr reads and writes it.
        position = vpx.uIntPtr.frompointer(last)
        start = position.value()
        if start + 3 > args.length():
            raise ValueError(f'vectorData needs three numbers, got {args.length() - start}')
        self.values = [args.asDouble(start + i) for i in range(3)]
        position.assign(start + 2)

    def writeASCII(self, out):
        for i, value in enumerate(self.values):
            if i:
                ov.VStreamUtils.writeCharBuffer(out, ' ')
            ov.VStreamUtils.writeDouble(out, value)


def create():
    return VectorData()


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Vorla Examples', '1.0')
    plugin.registerData(VectorData.type_name, VectorData.type_id, create)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterData(VectorData.type_id)
