# What Doxygen reads in place of the headers. There
# - a plain comment speaks for the whole paragraph that it heads,
# - a comment on a setter, a getter or a property speaks for the other two,
# - and what Qt or the language gives a fixed meaning goes without.
# Doxygen wants a comment for each declaration: this says on the same line what a reader of the header knows anyway.

# The text of a comment, or of the remark at the end of a line.
function text_of(line)
{
    sub(/^.*\/\/[\/!]?<? ?/, "", line)
    return line
}

function trim(line)
{
    sub(/^[ \t]+/, "", line)
    return line
}

function is_comment(line) { return line ~ /^\/\// }
function is_plain_comment(line) { return line ~ /^\/\/ / && line !~ /^\/\/ (---|SPDX|namespace)/ }
function has_remark(line) { return line ~ /[;,)a-zA-Z0-9}] +\/\/[\/!]?<? / }
function is_label(line) { return line ~ /^(public|protected|private|Q_SIGNALS|signals)[^(]*:$/ }
function is_wall(line)
{
    return line ~ /^[{}#]/ || line ~ /^(class|struct|namespace|enum|template|using|typedef|friend|extern|Q_OBJECT|Q_ENUM|Q_FLAG|Q_DECLARE|Q_DISABLE|return|if|for|case|else)/
}
function ends_statement(line)
{
    sub(/ *\/\/.*$/, "", line)
    return line ~ /[;{}]$/ || (line ~ /^Q_PROPERTY\(.*\)$/) || line ~ /^[A-Za-z_0-9]+( = [^(]*)?,?$/
}

# Name of the function, variable or property that a line declares.
function name_of(line)
{
    if (line ~ /^Q_PROPERTY/) {
        sub(/ (READ|WRITE).*$/, "", line)
        sub(/^.*[ *&]/, "", line)
        return line
    }
    sub(/ *(\/\/.*|= .*|\{.*)$/, "", line)
    sub(/[(;].*$/, "", line)
    sub(/^.*[ *&]/, "", line)
    return line
}

# The relatives of a name: what a setter sets, what sets a property.
function relatives(name, list,    bare)
{
    delete list
    if (name ~ /^set[A-Z]/) {
        bare = substr(name, 4)
        list[1] = tolower(substr(bare, 1, 1)) substr(bare, 2)
        list[2] = "is" bare
        list[3] = "get" bare
        list[4] = "has" bare
        return
    }
    bare = name
    if (bare ~ /^(is|has|get)[A-Z]/) sub(/^(is|has|get)/, "", bare)
    list[1] = "set" toupper(substr(bare, 1, 1)) substr(bare, 2)
}

# What a declaration without any comment means.
function meaning(declaration)
{
    if (declaration ~ /override;/) return "Overrides that of the base class; what it adds is told by the class."
    if (declaration ~ /= (default|delete);/) return "As the language has it."
    if (declaration ~ /^(virtual )?~/) return "Ends what runs and deletes what is owned."
    if (declaration ~ /^[A-Za-z]+\([A-Za-z]+&& other\);/ || declaration ~ /operator=\([A-Za-z]+&& /) return "Moves."
    if (declaration ~ /^[A-Za-z]+\(const [A-Za-z]+& other\);/ || declaration ~ /operator=\(const /) return "Copies."
    if (declaration ~ /operator[=!<]=?\(/) return "Compares the values."
    if (declaration ~ /^explicit [A-Za-z]+\(Q(Widget|Object)\* parent( = nullptr)?\);/) return "The parent owns it."
    if (declaration ~ /^Q_PROPERTY/) return "For style sheets and animations; see its functions."
    return ""
}

{ lines[NR] = $0 }

END {
    # First what is said, by name.
    comment = ""
    fresh = 0
    for (i = 1; i <= NR; ++i) {
        t = trim(lines[i])
        if (is_comment(t)) {
            comment = fresh ? comment " " text_of(t) : text_of(t)
            fresh = 1
            continue
        }
        if (fresh && t != "" && !is_label(t) && !is_wall(t) && !(name_of(t) in said)) said[name_of(t)] = comment
        else if (has_remark(t) && !(name_of(t) in said)) said[name_of(t)] = text_of(t)
        fresh = 0
    }

    paragraph = ""
    fresh = 0
    open = 0
    for (i = 1; i <= NR; ++i) {
        line = lines[i]
        t = trim(line)
        if (open) {
            print line
            if (ends_statement(t)) open = 0
            continue
        }
        if (is_comment(t)) {
            plain = is_plain_comment(t)
            if (t ~ /^\/\/ / && !plain) {
                paragraph = ""
                fresh = 0
                print line
                continue
            }
            paragraph = !plain ? "" : fresh ? paragraph " " text_of(t) : text_of(t)
            fresh = 1
            # It becomes one for Doxygen where the declarations follow at once.
            next_line = trim(lines[i + 1])
            if (plain && next_line != "" && !is_wall(next_line)) sub(/\/\/ /, "/// ", line)
            print line
            continue
        }
        if (t == "") {
            # A plain comment may stand alone above its paragraph.
            if (!fresh) paragraph = ""
            fresh = 0
            print line
            continue
        }
        if (is_label(t) || is_wall(t)) {
            # Template heads belong to what follows.
            if (t !~ /^(template|using)/) {
                paragraph = ""
                fresh = 0
            }
            print line
            continue
        }
        text = ""
        if (!fresh && !has_remark(t) && t !~ /^\/\*/ && t ~ /^[A-Za-z_~:].*[;,({)]/) {
            text = paragraph
            if (text == "") text = meaning(t)
            name = name_of(t)
            if (paragraph == "" && (text == "" || text ~ /^For style sheets/)) {
                if (t ~ /^Q_PROPERTY/) {
                    sub(/^.*READ /, "", t)
                    sub(/[ )].*$/, "", t)
                    name = t
                    t = trim(line)
                    if (name in said) text = "See " name "(): " said[name]
                }
                relatives(name, list)
                for (k in list) {
                    if (list[k] in said) text = "See " list[k] "(): " said[list[k]]
                }
            }
        }
        if (!fresh && has_remark(t)) {
            # A remark after a declaration is its comment, and that of the setter on the next line.
            if (line ~ /[;,] +\/\/ /) sub(/\/\/ /, "///< ", line)
            print line
            open = !ends_statement(t)
            continue
        }
        if (text != "") {
            indent = line
            sub(/[^ \t].*$/, "", indent)
            gsub(/\*\//, "* /", text)
            print indent "/** " text " */ " t
        } else {
            print line
        }
        fresh = 0
        open = !ends_statement(t)
    }
}
