# What scdoc leaves to the reader's luck: that options are shown in one piece and can be copied.

# Behind .TH, because that turns hyphenation on again.
/^\.TH /a .nh

# A hyphen that is one in every output, and where no line ends. Not in requests, nor in what moves the
# text of a list.
/^\./!{
/^\\h'/!s/-/\\-/g
}
