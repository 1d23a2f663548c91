# Pictures with a width, as the pages of the panes have them, in Doxygen's words; for FILTER_PATTERNS.
s|<img src="images/([^"]+)" width="([0-9]+)" alt="[^"]*">|\\image{inline} html \1 width=\2px|g
