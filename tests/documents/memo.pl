use RTF::Writer;
my $rtf = RTF::Writer->new_to_file("memo.rtf");
$rtf->prolog(title => "Memo", fonts => ["Courier New", "Arial"], colors => [undef, [255, 0, 0]]);
$rtf->paragraph(\'\fs32\b', "Memo 12");
$rtf->paragraph("Beam B3: ", \'\b', "HEA 200", \'\b0', ", see ", [\'\i', "sheet 4"], ".");
$rtf->paragraph(\'\li720\fi-720\tx720', "1.", \'\tab', "Weld all round; a = 5 mm");
$rtf->paragraph([\'\cf1', "Gr\x{f6}\x{df}e"], " 20 \x{b0}C; \x{394}t");
$rtf->close;
