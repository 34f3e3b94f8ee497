"""A file translator, vorlaText: the scene's nodes and their attribute
values as lines of text.

    vorla-text 1
    node sineNode sineNode1
    set sineNode1.input 0.5
    set sineNode1.amplitude 2.0
    set sineNode1.output 0.958851077208406

    vorla.export_scene('scene.vtx', 'vorlaText')
    vorla.export_scene('scene.vtx', 'vorlaText', {'precision': 4})
    vorla.import_scene('scene.vtx', 'vorlaText')

Values are JSON: numbers, and strings in double quotes. Every attribute is
written; reading sets those the graph lets it set, and the graph computes
the others again from them. The option `precision` (registered as 17, the
digits that keep every double exact) is the significant digits of the
numbers written.
"""
import json

import vorla

from openvorla import OpenVorlaVPx as vpx

HEADER = 'vorla-text 1'
OPTIONS = 'precision=17'


def parse_options(options):
    """'name=value;...' as a dict: the registered defaults, each replaced
    by what the script passed."""
    return dict(part.partition('=')[::2] for part in options.split(';') if part)


def rounded(value, digits):
    if isinstance(value, float):
        return float(f'{value:.{digits}g}')
    if isinstance(value, list):
        return [rounded(v, digits) for v in value]
    return value


class TextTranslator(vpx.VPxFileTranslator):
    name = 'vorlaText'

    def haveReadMethod(self):
        return True

    def haveWriteMethod(self):
        return True

    def defaultExtension(self):
        return 'vtx'

    def identifyFile(self, file, buffer, size):
        # buffer: the file's first size bytes, as text
        if buffer is not None and buffer.startswith(HEADER):
            return vpx.VPxFileTranslator.kIsMyFileType
        return vpx.VPxFileTranslator.kNotMyFileType

    def writer(self, file, options, mode):
        digits = int(parse_options(options)['precision'])
        lines = [HEADER]
        for node, node_type, _ in vorla.nodes():
            lines.append(f'node {node_type} {node}')
            for attribute in vorla.attributes(node):
                plug = f'{node}.{attribute}'
                lines.append(f'set {plug} {json.dumps(rounded(vorla.get_attr(plug), digits))}')
        with open(file.rawFullName(), 'w', encoding='utf-8') as out:
            out.write('\n'.join(lines) + '\n')
        # Returning None is success; an exception fails the export and is
        # reported in the application's log.

    def reader(self, file, options, mode):
        with open(file.rawFullName(), encoding='utf-8') as text:
            lines = text.read().splitlines()
        if not lines or lines[0] != HEADER:
            raise ValueError(f'{file.rawFullName()} is not a {HEADER!r} file')
        for number, line in enumerate(lines[1:], 2):
            word, _, rest = line.partition(' ')
            if word == 'node':
                node_type, node = rest.split()
                vorla.create_node(node_type, node)
            elif word == 'set':
                plug, value = rest.split(' ', 1)
                try:
                    vorla.set_attr(plug, json.loads(value))
                except RuntimeError as refused:
                    # A computed plug: its node computes it from the others.
                    if not str(refused).endswith('is not writable'):
                        raise
            elif line.strip():
                raise ValueError(f'line {number}: cannot read {line!r}')


def create():
    return TextTranslator()


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Vorla Examples', '1.0')
    plugin.registerFileTranslator(TextTranslator.name, None, create, None, OPTIONS)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterFileTranslator(TextTranslator.name)
