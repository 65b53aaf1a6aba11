<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr_FR">
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Avertissement</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Échec du contrôle de référence</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Mémoire de l&apos;instrument pleine</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>La mémoire est insuffisante pour ce travail. Supprimez des travaux existants pour libérer de la mémoire.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Aucune entrée dans la base de données</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Mesure annulée</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>L&apos;instrument a été déplacé pendant la mesure</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Index non valide</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Erreur d&apos;étalonnage</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Instrument pas sur la céramique blanche, ou blanc interne sale</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Données d&apos;étalonnage non valides</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Non étalonné</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Céramique blanche externe trop sale ou incorrecte</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Mesure interrompue</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>La mesure a été interrompue par l&apos;utilisateur</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batterie faible. Rechargez la batterie</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batterie vide. L&apos;instrument va s&apos;éteindre</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Erreur du moteur d&apos;obturateur</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Aucune mesure de référence enregistrée</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Temps d&apos;intégration spectrale sur le blanc trop long</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Décalage de longueur d&apos;onde au-delà de la limite de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Mémoire presque pleine</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problème lors du changement de mode Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problème lors de la recherche de réseaux Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Température de l&apos;échantillon trop élevée (capteur IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Température de l&apos;échantillon trop basse (capteur IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Niveau de batterie trop faible pour la mise à jour</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Date et heure non réglées</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problème lors de l&apos;initialisation. Redémarrez l&apos;appareil</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Erreur de communication matérielle. Redémarrez l&apos;appareil</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Erreur pendant la mesure</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Meilleures correspondances différentes pour les points de contrôle</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Étalonnage en cours</translation>
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
        <translation>Supprimer tous les échantillons ?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Non</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrument verrouillé</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Éteindre</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Redémarrer</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Une erreur s&apos;est produite. Redémarrez l&apos;instrument</translation>
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
        <translation>Synchronisation des données du travail</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Enregistrer la moyenne</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Recommencer le travail</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Annuler</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Annuler l&apos;action</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Retour</translation>
    </message>
</context>
</TS>
