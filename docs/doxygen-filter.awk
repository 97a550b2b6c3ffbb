# What Doxygen reads instead of the headers themselves. Here a comment speaks for all declarations that follow it
# without a blank line, as for a setter and its getter, and an override without a comment does what the class comment
# and the base class say. Doxygen wants a comment for each: it is repeated, on the same line.

function flush_statement() { statement = "" }

function doc_text(line)
{
    sub(/^[ \t]*\/\/[\/!] ?/, "", line)
    return line
}

{
    line = $0
    trimmed = line
    sub(/^[ \t]+/, "", trimmed)
}

# Within a statement of several lines nothing is added.
open {
    print line
    if (trimmed ~ /[;{}][ \t]*(\/\/.*)?$/) open = 0
    next
}

trimmed ~ /^\/\/[\/!]</ { print line; next }

trimmed ~ /^\/\/[\/!]/ {
    comment = fresh ? comment " " doc_text(trimmed) : doc_text(trimmed)
    fresh = 1
    print line
    next
}

# A blank line, a label or a brace ends what a comment speaks for.
trimmed == "" || trimmed ~ /^(public|protected|private|Q_SIGNALS|signals)[^(]*:$/ || trimmed ~ /^[{}]/ || trimmed ~ /^(class|struct|namespace|enum|template|using|typedef|friend|#|Q_)/ || trimmed ~ /^\/\// {
    keep = trimmed ~ /^(template|using)/
    print line
    if (!keep) { fresh = 0; comment = "" }
    next
}

{
    own = fresh || line ~ /\/\/[\/!]</ || trimmed ~ /^\/\*/
    text = ""
    if (!own && trimmed ~ /^[A-Za-z_~:].*[;,({]/) {
        if (comment != "") text = comment
        else if (trimmed ~ /override;/) text = "Overrides that of the base class."
        else if (trimmed ~ /= (default|delete);/) text = "As it stands."
        else if (trimmed ~ /^~|^virtual ~/) text = "Ends what runs and takes its parts along."
    }
    if (text != "") {
        indent = line
        sub(/[^ \t].*$/, "", indent)
        gsub(/\*\//, "* /", text)
        print indent "/** " text " */ " trimmed
    } else {
        print line
    }
    fresh = 0
    if (trimmed !~ /[;{},][ \t]*(\/\/.*)?$/ || trimmed ~ /,[ \t]*$/) open = 1
    if (trimmed ~ /^[A-Za-z_0-9 =]+,/) open = 0
}
