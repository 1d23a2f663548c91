// The item types of the library's own panes, family by family.
#pragma once

class ItemRegistry;

// Each also tells the tree dump what its panes show.
void AddButtonItems(ItemRegistry &);   // OvalButton, StudButton, FrameButton
void AddIconItems(ItemRegistry &);     // Icon, IconButton, SuccessiveIcons, TwistDown, TrackSelector
void AddBoxItems(ItemRegistry &);      // Box, BoxSelect
void AddChoiceItems(ItemRegistry &);   // CheckBox, RadioButton
void AddLabelItems(ItemRegistry &);    // Label
void AddStringItems(ItemRegistry &);   // Text, StyledText, StringGroup, MultiString
void AddGroupItems(ItemRegistry &);    // Group, Spacer
void AddScrollItems(ItemRegistry &);   // ScrollBar, GrowBox
void AddScrolledItems(ItemRegistry &); // ScrollPane, Grid, ScrollGrid
void AddMenuItems(ItemRegistry &);     // PopUpMenu, ScrollBarPopUpMenu, DurationNote
void AddTabItems(ItemRegistry &);      // Tabs
void AddSelectItems(ItemRegistry &);   // Select, SelectString
void AddListItems(ItemRegistry &);     // List
void AddGraphicItems(ItemRegistry &);  // ProgressBar, Line, Picture
void AddThreeDItems(ItemRegistry &);   // ThreeD
void AddGraphItems(ItemRegistry &);    // Graph
void AddZoomItems(ItemRegistry &);     // ZoomSlider, ZoomButtons
void AddTextItems(ItemRegistry &);     // TextField, TextEdit, SearchField
