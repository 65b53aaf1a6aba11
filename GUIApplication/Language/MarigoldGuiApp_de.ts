<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Kalibrierung erforderlich</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>Neue Messungen sind erst nach der Kalibrierung des Geräts möglich. Drücken Sie „Kalibrieren“, um die Kalibrierung zu starten.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignorieren</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Kalibrierung fällig in %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>Sekunden</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>Minuten</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>Stunden</translation>
    </message>
    <message>
        <source>days</source>
        <translation>Tagen</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Kalibrierung beginnt</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Kalibrierung läuft</translation>
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
        <source>Complete</source>
        <translation>Abgeschlossen</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Gerät darf bewegt werden</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Messung beginnt</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>Messung läuft</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Nicht alle Drucksensoren sind aktiv. Drücken Sie OK, um die Kalibrierung zu starten, sobald alle Drucksensoren aktiv sind</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Falsche Position</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>AUF EBENE FLÄCHE STELLEN</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>WEISSE LINIE AUSRICHTEN</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Tippen Sie auf „Kalibrieren“, um die Kalibrierung zu starten</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Kalibrieren</translation>
    </message>
    <message>
        <source>or</source>
        <translation>oder</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Drücken Sie die Messtaste am Gerät</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Schritt 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Schritt %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Tippen Sie auf „Selbsttest“, um den Selbsttest zu starten</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Selbsttest</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Kalibrieren Sie Ihr Gerät mit dem mitgelieferten Weißstandard.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Setzen Sie das Gerät auf den Weißstandard und richten Sie die weiße Linie an der gewünschten Referenz aus.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Prüfen Sie Ihr Gerät mit dem mitgelieferten Effekt-Referenzstandard. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Setzen Sie das Gerät auf den Effekt-Referenzstandard und richten Sie die weiße Linie an der gewünschten Referenz aus</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Führen Sie den Selbsttest mit dem mitgelieferten Weißstandard durch. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Setzen Sie das Gerät auf den Weißstandard und richten Sie die weiße Linie an der gewünschten Referenz aus</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Führen Sie den Selbsttest mit dem mitgelieferten Effekt-Referenzstandard durch. Seriennummer: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Führen Sie den Selbsttest durch, indem Sie das Gerät frei in die Luft halten (nirgends aufgesetzt)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Kalibrierung</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Selbsttest %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Referenzkachel-Prüfung</translation>
    </message>
</context>
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
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Datenbank löschen</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>Möchten Sie die Datenbank wirklich löschen? Alle Proben und Aufträge auf dem Gerät werden gelöscht.</translation>
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
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Notizen</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Sonderzeichen</translation>
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
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Name</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>Auftragsname darf nicht leer sein</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Geben Sie einen eindeutigen, nicht leeren Auftragsnamen ein</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>Auftragsname existiert bereits</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>Dieser Auftragsname existiert bereits. Bitte wählen Sie einen eindeutigen Namen</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>Merkmal existiert nicht</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>Dieses Merkmal existiert nicht. Bitte wählen Sie ein vorhandenes Merkmal</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
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
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Zum Bestätigen den Punkt einmal um den Kreis ziehen</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Werkseinstellungen</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>Alle Einstellungen werden zurückgesetzt. Auch alle Aufträge und Proben gehen verloren!</translation>
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
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Bestanden</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Abgebrochen</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Störung</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Gerät frei in der Luft halten</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Gerät nicht berühren oder anstoßen</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Abgeschlossen</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Selbsttest</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Weißkalibrierung</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Referenzprüfung auf Weiß</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Effektkachel-Test</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Wiederholbarkeitstests</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Temperaturtests</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Drucksensortest</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Fehlerprotokolle prüfen</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Test läuft...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Alle Tests abgeschlossen</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Selbsttests abgebrochen</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Datenbank / Speicher</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Proben</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Aufträge</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Datenbank löschen</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>Keine Dateien</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Anzeige</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Displayhelligkeit</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>Die Datei kann nicht angezeigt werden.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>Die Datei kann nicht gelesen werden.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Rechtliche Hinweise</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 Stunde </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 Stunden </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 Minuten und </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 Sekunden</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Nie</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Abdunkeln nach: %1
Standby nach: %2
Ausschalten nach: %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 von %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Nie</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Gültig</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Abgelaufen</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>Nicht verbunden</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1 %</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Ein/Aus</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Kalibrierung</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Messoptionen</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>WLAN</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Anzeige</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Signaltonlautstärke</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Energiesparen</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>System und Diagnose</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>Ein</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Messoptionen</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Automatische Messung</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Zeit bis zur automatischen Messung (s):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Messmodus</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>Anzahl nötiger guter Messungen:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Maximale Anzahl Messungen:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Automatische Messungen: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>LABCH anzeigen: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Drucksensoren übergehen: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Energie-
sparen</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Display abdunkeln</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Standby</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Ausschalten</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Sekunden bis zum Abdunkeln:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minuten bis Standby:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minuten bis zum Ausschalten:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Ein/Aus</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Ausschalten</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Neu starten</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>Gerät ausschalten?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>Möchten Sie das Gerät wirklich ausschalten?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>In den Standby wechseln?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>Möchten Sie das Gerät wirklich in den Standby versetzen?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>Gerät neu starten?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>Möchten Sie das Gerät wirklich neu starten?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Ja</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Nein</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>System und
Diagnose</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>Systeminformationen</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Datenbank / Speicher</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Rechtliche Hinweise</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Selbsttest</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>Systeminformationen</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>Nicht eingerichtet</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Gerätemodell:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>Seriennummer:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Teilenummer:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>Weißstandard:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Zertifizierungsdatum:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Firmware-Version:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Oberflächen-Version:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Kernel:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Bootloader:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>Server-URL:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Werkseinstellungen</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Open Source</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>Signaltonlautstärke</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>WLAN</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Ein</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>Statische IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Bekannte Netzwerke</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Verfügbare Netzwerke</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Verbindungsproblem</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Falsches Passwort</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Netzwerk außer Reichweite</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
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
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Auftrag</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Zum Messen Taste drücken.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Positionieren</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Gemittelt 0 von SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Messen</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Beenden</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Online-Modus</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Gemittelt %1 von SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>Online-Modus beenden?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>Das Beenden des Online-Modus stoppt das Positionieren und kehrt zur Auftragsliste zurück.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Beenden</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>Messung beenden?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>Alle gemessenen Proben und dieser Auftrag werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>Alle gemessenen Proben dieses Auftrags werden endgültig gelöscht.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Warnung</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Weiter</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Temperatur außerhalb des Bereichs. Online-Modus bis zum Ende fortsetzen oder Online-Modus beenden und zur Auftragsliste zurückkehren?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Temperatur außerhalb des Bereichs. Auftrag bis zum Ende fortsetzen oder Auftrag mit allen Proben löschen und zur Auftragsliste zurückkehren?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Temperatur außerhalb des Bereichs. Auftrag bis zum Ende fortsetzen oder alle Proben löschen und zur Auftragsliste zurückkehren?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>Drucksensoren übergehen?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>Nicht alle Drucksensoren sind aktiv. Drücken Sie die Messtaste erneut, um eine Messung zu starten, oder Abbrechen, um zum Positionieren zurückzukehren.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>Nicht alle Drucksensoren sind aktiv. Bitte stellen Sie vor dem Messen sicher, dass alle Drucksensoren aktiv sind</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>Messung fortsetzen?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>Zum Fortsetzen der Messungen OK drücken</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Auftragszeit abgelaufen</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>Der Auftrag wurde nicht in der vorgesehenen Zeit abgeschlossen</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC vorzeitig beendet, alle Messungen zum Ergebnis gemittelt.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Höchstzahl der SMC-Messungen für diesen Auftrag erreicht</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Abgeschlossen</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>Der Auftrag ist abgeschlossen. Drücken Sie OK, um den Online-Modus zu beenden</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC vorzeitig beendet, alle Messungen zum Ergebnis gemittelt. Drücken Sie OK, um den Online-Modus zu beenden</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC nach der Höchstzahl von %1 Messungen fehlgeschlagen, das Ergebnis ist gemittelt. Drücken Sie OK, um den Online-Modus zu beenden</translation>
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
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
