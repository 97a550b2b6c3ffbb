# A link to a heading of the same page is plain text for Doxygen, which knows headings by other names.
s/\[([^]]*)\]\(#[^)]*\)/\1/g
# Nor are colours and sub-controls links.
/^\|/s/#([A-Za-z0-9])/\\#\1/g
s/`::([a-z-]+)`/`\1`/g
