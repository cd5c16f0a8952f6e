"""Faults that need no imagination: small changes at every place of a C++ source where the kind of change applies."""

import re

TOKEN = re.compile(r"""//[^\n]*|^\#[^\n]*|R"\(.*?\)"|"(?:\\.|[^"\\\n])*"|'(?:\\.|[^'\\])+'|\d(?:[\w.]|'\d)*|[A-Za-z_]\w*
                       |->|::|<=|>=|==|!=|&&|\|\||<<|>>|\+\+|--|[-+*/%&|^]=|\S""", re.S | re.M | re.X)
FLIPPED = {"==": "!=", "!=": "==", "<": "<=", "<=": "<", ">": ">=", ">=": ">", "&&": "||", "||": "&&", "+": "-",
           "-": "+", "*": "/", "/": "*", "<<": ">>", ">>": "<<", "|": "^", "&": "|", "&=": "|=", "+=": "-=",
           "true": "false", "false": "true"}
CLOSING = {"(": ")", "[": "]", "{": "}"}


def tokens_of(text):
    """What the compiler sees: comments and preprocessor lines left out."""
    found = [m for m in TOKEN.finditer(text) if not m[0].startswith(("//", "#"))]
    return [(m[0], m.start(), m.end()) for m in found]


def closed_by(tokens):
    """For each opening bracket the place of the one that closes it."""
    ends, open_ones = {}, []
    for i, (token, _, _) in enumerate(tokens):
        if token in CLOSING:
            open_ones.append(i)
        elif token in CLOSING.values() and open_ones:
            ends[open_ones.pop()] = i
    return ends


def parts(tokens, ends, opening):
    """The parts between commas inside a bracket, each as its first and last token."""
    first, i = opening + 1, opening + 1
    while i <= ends[opening]:
        if (tokens[i][0] == "," or i == ends[opening]):
            if i > first:
                yield first, i - 1
            first = i + 1
        i = ends.get(i, i) + 1


def other_number(text):
    digits = text.replace("'", "")
    if re.fullmatch(r"\d+\.\d*", digits):
        return str(float(digits) * 2 or 1.0)
    number = re.fullmatch(r"(0[xX][0-9A-Fa-f]+|\d+)[uUlL]*", digits)
    return number and (hex if digits[:2] in ("0x", "0X") else str)(int(number[1], 0) + 1)


def changed_words(text, start, line):
    """Scripts lose a word of each line and have their numbers changed; any other text gets a letter more."""
    if not re.search(r"\w \w", text):
        yield start + len(text) - 1, start + len(text) - 1, "x"
        return
    for script in re.finditer(r"[^\n]+", text[3:-2] if text.startswith("R") else text[1:-1]):
        at = start + (3 if text.startswith("R") else 1) + script.start()
        words = list(re.finditer(r"\S+", script[0]))
        word = words[(line := line + 1) % len(words)]
        yield at + word.start(), at + word.end() + 1 - (word is words[-1]), ""
        for number in re.finditer(r"(?<![\w.])\d+", script[0]):
            yield at + number.start(), at + number.end(), str(int(number[0]) + 1)


def changed_tables(tokens, ends, text):
    """Rows that are dropped, that exchange what stands first in them, or their places where the order counts."""
    for i, (token, _, _) in enumerate(tokens):
        if token != "{" or i < 2 or tokens[i - 1][0] != "=" or tokens[i - 2][0] != "]":
            continue
        rows = list(parts(tokens, ends, i))
        span = [(tokens[first][1], tokens[last][2]) for first, last in rows]
        for n, (first, _) in enumerate(rows if len(rows) > 1 else []):
            yield span[n][0], tokens[rows[n][1] + 1][2], ""
            if n + 1 == len(rows):
                continue
            between = text[span[n][1]:span[n + 1][0]]
            whole = text[slice(*span[n])], text[slice(*span[n + 1])]
            if tokens[i - 4][0].endswith("Order"):
                yield span[n][0], span[n + 1][1], whole[1] + between + whole[0]
            if tokens[first][0] == "{":
                (one, one_rest), (other, other_rest) = (text.split(",", 1) for text in whole)
                if one_rest != other_rest:
                    yield span[n][0], span[n + 1][1], f"{other},{one_rest}{between}{one},{other_rest}"


def changed_statements(tokens, ends, text):
    for i, (token, start, end) in enumerate(tokens):
        if token in ("if", "while") and tokens[i + 1][0] == "(":
            inside = tokens[i + 1][2], tokens[ends[i + 1]][1]
            yield *inside, "false"
            if token == "if":
                yield *inside, "true"
        elif token == "?":
            depth_end = next(k for k in range(i, len(tokens)) if tokens[k][0] == ":")
            last = depth_end + 1
            while tokens[last][0] not in (";", ",", ")", "]", "}"):
                last = ends.get(last, last) + 1
            yield (tokens[i + 1][1], tokens[last - 1][2], text[tokens[depth_end + 1][1]:tokens[last - 1][2]] + " : " +
                   text[tokens[i + 1][1]:tokens[depth_end - 1][2]])
        elif i and tokens[i - 1][0] in (";", "{", "}", ")") and re.match(r"[A-Za-z_*]", token):
            stop = i
            while stop < len(tokens) and tokens[stop][0] not in (";", "{", "}", ":"):
                stop = ends.get(stop, stop) + 1
            if stop >= len(tokens) or tokens[stop][0] != ";":
                if token != "return":
                    continue
                while tokens[stop][0] != ";":
                    stop = ends.get(stop, stop) + 1
            statement = text[start:tokens[stop][1]]
            if token == "return" and statement not in ("return", "return 0", "return false", "return nullptr"):
                yield start, tokens[stop][1], "return {}"
            elif re.match(r"(return|break|continue)$|[\w:.>*\[\]-]+ ?(\(|[-+|&]?= )", statement):
                if tokens[i - 1][0] != ")":  # that is what "if (false)" does
                    yield start, tokens[stop][2], ""


def exchanged_names(tokens, text):
    """A constant for another one of its kind: of a named set, or declared with the same type in this file."""
    kinds = {}
    for kind, name in re.findall(r"constexpr ((?:\w|::)+) (k[A-Z]\w*)", text):
        kinds.setdefault(kind, []).append(name)
    for space, name in re.findall(r"\b(App|Key|Bundle|HostVirtualKey)::(\w+)", text):
        kinds.setdefault(space, []).append(name)
    for i, (token, start, end) in enumerate(tokens):
        qualified = i > 1 and tokens[i - 1][0] == "::"
        declared = re.search(r"constexpr (?:\w|::)+ $", text[:start])
        row = re.search(r"\{[^(;]*$", text[text.rindex("\n", 0, start) + 1:start]) if "\n" in text[:start] else None
        for kind, names in kinds.items():
            names = sorted(set(names))
            of_kind = token in names and len(names) > 1 and qualified == (kind == tokens[i - 2][0])
            if of_kind and not declared and not row:
                yield start, end, names[(names.index(token) + 1) % len(names)]


def is_whole_condition(tokens, ends, i):
    """Whether a comparison is all that an if asks: that is made true and false anyway."""
    opening = max((k for k in range(i) if ends.get(k, 0) > i), default=0)
    inside = {token for token, _, _ in tokens[opening:ends.get(opening, 0)]}
    return tokens[opening - 1][0] == "if" and not inside & {"&&", "||"}


def faults_in(text):
    """Each fault as the place, the end and the replacement of what it changes, in the order of the places."""
    tokens = tokens_of(text)
    ends = closed_by(tokens)
    found = [*changed_tables(tokens, ends, text), *changed_statements(tokens, ends, text),
             *exchanged_names(tokens, text)]
    for i, (token, start, end) in enumerate(tokens):
        spaced = text[start - 1:start].isspace() and text[end:end + 1].isspace()
        if token in ("==", "!=", "!") and is_whole_condition(tokens, ends, i):
            continue
        if token in FLIPPED and (spaced or token in ("true", "false")):
            found.append((start, end, FLIPPED[token]))
        elif token == "!":
            found.append((start, end, ""))
        elif token[0].isdigit() and other_number(token):
            found.append((start, end, other_number(token)))
        elif token[0] == '"' or token.startswith('R"'):
            found.extend(changed_words(token, start, text.count("\n", 0, start)))
        elif token == "(" and re.match(r"\w", tokens[i - 1][0]) and tokens[i - 1][0] not in ("if", "for", "while"):
            spans = [(tokens[a][1], tokens[b][2]) for a, b in parts(tokens, ends, i)]
            for one, two in zip(spans, spans[1:]):
                first, second = text[slice(*one)], text[slice(*two)]
                if first != second and not re.search(r"[\w>*&] [*&]?\w+$|\"|nullptr|Callback", first + "," + second):
                    found.append((one[0], two[1], second + text[one[1]:two[0]] + first))
    return sorted(set(found))
