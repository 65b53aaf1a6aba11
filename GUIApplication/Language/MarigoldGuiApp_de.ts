<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Referenzprüfung fehlgeschlagen</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Gerätespeicher voll</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Der Speicher reicht für diesen Auftrag nicht aus. Bitte löschen Sie vorhandene Aufträge, um Speicher freizugeben.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Keine Datenbankeinträge</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Messung abgebrochen</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>Das Gerät wurde während der Messung bewegt</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Ungültiger Index</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Kalibrierfehler</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Gerät nicht auf der Weißkachel oder interner Weißstandard verschmutzt</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Kalibrierdaten ungültig</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Nicht kalibriert</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Externe Weißkachel zu verschmutzt oder falsche Weißkachel</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Messung abgebrochen</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>Die Messung wurde vom Benutzer abgebrochen</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Akku schwach. Bitte Akku laden</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Akku leer. Das Gerät schaltet sich aus</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Fehler im Verschlussmotor</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Keine gespeicherte Referenzmessung</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Spektrale Integrationszeit auf Weiß zu lang</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Wellenlängenverschiebung über dem Grenzwert von 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Wenig Speicher frei</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Fehler beim Wechsel des WLAN-Modus</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Fehler bei der WLAN-Suche</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Probentemperatur zu hoch (IR-Sensor)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Probentemperatur zu niedrig (IR-Sensor)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Akkuladung für das Update zu gering</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Datum und Uhrzeit nicht eingestellt</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Fehler bei der Initialisierung. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Kommunikationsfehler der Hardware. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Fehler während der Messung</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Unterschiedliche beste Übereinstimmungen der Prüfpunkte</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Kalibrierung läuft</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Alle Proben löschen?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Nein</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Messung löschen?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Nein</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Kamerabilder</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Auftrag löschen</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Auftrag ansehen/bearbeiten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Auftrag kopieren</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Auftrag an Server senden</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Auftrag ausführen</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Alle abgeschlossenen Aufträge löschen</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Aufträge</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Offen</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Fertig</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Offen (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Fertig (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Auftrag löschen?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>Der gesamte Auftrag und alle Proben werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Alle abgeschlossenen Aufträge löschen?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Alle abgeschlossenen Aufträge werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Gerätespeicher voll</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>Ein neuer Auftrag kann erst angelegt werden, wenn vorhandene Aufträge vom Gerät gelöscht wurden.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Der Speicher reicht für diesen Auftrag nicht aus. Bitte löschen Sie vorhandene Aufträge, um Speicher freizugeben.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Übersicht</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Messen</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Auftragsdetails</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Name:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notizen:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Auftrag an Server senden</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC-Ergebnis</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Mittelwert</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Messungen</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1 von %2 fertig</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Auftrag löschen?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>Der gesamte Auftrag und alle Proben werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Dieser Auftrag wurde nicht auf dem Gerät erstellt. Möchten Sie ihn wirklich bearbeiten?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Gerät gesperrt</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>Messung läuft</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Ruhig halten</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Gerät nicht berühren oder anstoßen</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>Berechnung läuft</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Gerät darf bewegt werden</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Ausschalten</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Neu starten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Ein Fehler ist aufgetreten. Bitte starten Sie das Gerät neu</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Farbansicht</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>15%1-Reihe</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>45%1-Reihe</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>15%1-Textur</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>Für diesen Auftrag sind weitere Messungen nötig</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Messung</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Kamerabilder</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Details</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Englisch</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Spanisch</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Französisch</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Deutsch</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italienisch</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Portugiesisch</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japanisch</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Koreanisch</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chinesisch (vereinfacht)</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Benutzerdefiniert</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>Diffus</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>Mittelklasse</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>Keine Mittelung</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Mittelung 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Mittelung 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Weißstandard</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Referenzstandard</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Abgehoben</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Weißstandard fertig</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Referenzstandard fertig</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Abheben fertig</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Auftragsdaten werden synchronisiert</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Mittelwert speichern</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Auftrag neu starten</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Rückgängig</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Alle Aufträge an Server senden</translation>
    </message>
</context>
</TS>
