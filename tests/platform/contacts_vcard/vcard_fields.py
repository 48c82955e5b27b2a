#!/usr/bin/python3
"""Reads a vCard file with vobject and prints every property of every card,
one per line: NAME <tab> TYPES <tab> OTHER PARAMETERS <tab> VALUE <tab> LABEL.
TYPES are sorted and joined by commas; structured values are joined by ';',
lists by ','; binary values are printed as 'sha1:' and their SHA-1; a
grouped property gets the X-ABLabel of its group as LABEL. Newlines in
values are printed as \\n. Cards end with a line 'END'."""
import hashlib
import sys

import vobject


def flat(value):
    if isinstance(value, bytes):
        return 'sha1:' + hashlib.sha1(value).hexdigest()
    if isinstance(value, (list, tuple)):
        return ','.join(flat(v) for v in value)
    if isinstance(value, vobject.vcard.Name):
        return ';'.join(flat(getattr(value, f)) for f in ('family', 'given', 'additional', 'prefix', 'suffix'))
    if isinstance(value, vobject.vcard.Address):
        return ';'.join(flat(getattr(value, f)) for f in ('box', 'extended', 'street', 'city', 'region', 'code', 'country'))
    return str(value)


def main(path):
    with open(path, encoding='utf-8', newline='') as f:
        text = f.read()
    for card in vobject.readComponents(text):
        labels = {}
        for prop in card.getChildren():
            if prop.name == 'X-ABLABEL' and prop.group:
                labels[prop.group] = flat(prop.value)
        for prop in card.getChildren():
            if prop.name in ('X-ABLABEL', 'VERSION'):
                continue
            params = dict(prop.params)
            types = sorted(t.upper() for value in params.pop('TYPE', []) for t in value.split(','))
            others = sorted('%s=%s' % (k, ','.join(v)) for k, v in params.items() if k != 'ENCODING')
            value = prop.value
            if prop.name == 'ORG' and isinstance(value, list):
                value = ';'.join(flat(v) for v in value)
            line = [prop.name, ','.join(types), ' '.join(others), flat(value), labels.get(prop.group, '')]
            print('\t'.join(part.replace('\n', '\\n') for part in line))
        print('END')


if __name__ == '__main__':
    main(sys.argv[1])
