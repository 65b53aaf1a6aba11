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
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Gerät gesperrt</translation>
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
</TS>
