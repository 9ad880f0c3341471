<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en" sourcelanguage="en">
<context>
    <name>ArchiveList</name>
    <message>
        <source>File</source>
        <translation>File</translation>
    </message>
    <message>
        <source>Folder</source>
        <translation>Folder</translation>
    </message>
</context>
<context>
    <name>ArchiveMenu</name>
    <message>
        <source>Copy</source>
        <translation>Copy</translation>
    </message>
    <message>
        <source>Create New</source>
        <translation>Create New</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Paste</translation>
    </message>
    <message>
        <source>Save as Template</source>
        <translation>Save as Template</translation>
    </message>
</context>
<context>
    <name>BoldToolBox</name>
    <message>
        <source>Style</source>
        <translation>Style</translation>
    </message>
</context>
<context>
    <name>CanvasScene</name>
    <message>
        <source>Text Input</source>
        <translation>Text Input</translation>
    </message>
    <message>
        <source>Title goes here</source>
        <translation>Title goes here</translation>
    </message>
</context>
<context>
    <name>ColorPalette</name>
    <message>
        <source>Color Palette</source>
        <translation>Color Palette</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>EdgeSizeSlider</name>
    <message>
        <source>px</source>
        <translation>px</translation>
    </message>
</context>
<context>
    <name>EdgeToolBox</name>
    <message>
        <source>Edge</source>
        <translation>Edge</translation>
    </message>
    <message>
        <source>px</source>
        <translation>px</translation>
    </message>
</context>
<context>
    <name>FamilyToolBox</name>
    <message>
        <source>Font</source>
        <translation>Font</translation>
    </message>
</context>
<context>
    <name>FolderPicker</name>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
    <message>
        <source>Duplicate</source>
        <translation>Duplicate</translation>
    </message>
    <message>
        <source>File</source>
        <translation>File</translation>
    </message>
    <message>
        <source>Folder Name</source>
        <translation>Folder Name</translation>
    </message>
    <message>
        <source>New Folder</source>
        <translation>New Folder</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Open</translation>
    </message>
    <message>
        <source>Untitled</source>
        <translation>Untitled</translation>
    </message>
    <message>
        <source>folder</source>
        <translation>folder</translation>
    </message>
    <message>
        <source>Select Folder</source>
        <translation>Select Folder</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Date</source>
        <translation>Date</translation>
    </message>
    <message>
        <source>The following characters cannot be entered.
\ / : , ; * ? &quot; &lt; &gt; | [ ] = .</source>
        <translation>The following characters cannot be entered.
\ / : , ; * ? &quot; &lt; &gt; | [ ] = .</translation>
    </message>
    <message>
        <source>You can only enter up to 20 characters.</source>
        <translation>You can only enter up to 20 characters.</translation>
    </message>
</context>
<context>
    <name>GraphicsText</name>
    <message>
        <source>Text Input</source>
        <translation>Text Input</translation>
    </message>
    <message>
        <source>Title goes here</source>
        <translation>Title goes here</translation>
    </message>
</context>
<context>
    <name>KerningToolBox</name>
    <message>
        <source>Space</source>
        <translation>Space</translation>
    </message>
</context>
<context>
    <name>LossDescription</name>
    <message>
        <source>Not saved: %1</source>
        <translation>Not saved: %1</translation>
    </message>
    <message>
        <source>the title &quot;%1&quot;</source>
        <translation>the title &quot;%1&quot;</translation>
    </message>
    <message>
        <source>the order of the titles in &quot;%1&quot;</source>
        <translation>the order of the titles in &quot;%1&quot;</translation>
    </message>
    <message>
        <source>the pictures of &quot;%1&quot;</source>
        <translation>the pictures of &quot;%1&quot;</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>%1 more</translation>
    </message>
</context>
<context>
    <name>RangeOfMoveText</name>
    <message>
        <source>Range of move per 1 tap</source>
        <translation>Range of move per 1 tap</translation>
    </message>
    <message>
        <source>2px</source>
        <translation>2px</translation>
    </message>
    <message>
        <source>10px</source>
        <translation>10px</translation>
    </message>
</context>
<context>
    <name>SaveOutage</name>
    <message>
        <source>File</source>
        <translation>File</translation>
    </message>
</context>
<context>
    <name>SavingNotice</name>
    <message>
        <source>Saving...</source>
        <translation>Saving...</translation>
    </message>
</context>
<context>
    <name>ShadowToolBox</name>
    <message>
        <source>Shadow</source>
        <translation>Shadow</translation>
    </message>
</context>
<context>
    <name>SizeToolBox</name>
    <message>
        <source>Size</source>
        <translation>Size</translation>
    </message>
    <message>
        <source>pt</source>
        <translation>pt</translation>
    </message>
    <message>
        <source>Font Size</source>
        <translation>Font Size</translation>
    </message>
</context>
<context>
    <name>TemplatePicker</name>
    <message>
        <source>Templates</source>
        <translation>Templates</translation>
    </message>
    <message>
        <source>Preset</source>
        <translation>Preset</translation>
    </message>
    <message>
        <source>User</source>
        <translation>User</translation>
    </message>
    <message>
        <source>File Name</source>
        <translation>File Name</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>Text</translation>
    </message>
    <message>
        <source>Select</source>
        <translation>Select</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancel</translation>
    </message>
</context>
<context>
    <name>TitlerWindow</name>
    <message>
        <source>Titler</source>
        <translation>Titler</translation>
    </message>
    <message>
        <source>Move</source>
        <translation>Move</translation>
    </message>
    <message>
        <source>Done</source>
        <translation>Done</translation>
    </message>
</context>
<context>
    <name>ToolsBar</name>
    <message>
        <source>Folder</source>
        <translation>Folder</translation>
    </message>
    <message>
        <source>New Text</source>
        <translation>New Text</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>Undo</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>Redo</translation>
    </message>
    <message>
        <source>Safe Area</source>
        <translation>Safe Area</translation>
    </message>
    <message>
        <source>Canvas</source>
        <translation>Canvas</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Close</translation>
    </message>
    <message>
        <source>Black</source>
        <translation>Black</translation>
    </message>
    <message>
        <source>White</source>
        <translation>White</translation>
    </message>
    <message>
        <source>Checker</source>
        <translation>Checker</translation>
    </message>
</context>
<context>
    <name>UserTemplateMenu</name>
    <message>
        <source>Create New</source>
        <translation>Create New</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Copy</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>Paste</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Delete</translation>
    </message>
    <message>
        <source>Add Template</source>
        <translation>Add Template</translation>
    </message>
</context>
</TS>
