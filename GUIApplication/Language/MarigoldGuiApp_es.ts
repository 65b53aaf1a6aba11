<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Advertencia</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Falló la comprobación de referencia</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memoria del instrumento llena</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>No hay memoria suficiente para completar el trabajo. Elimine trabajos existentes para liberar memoria.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>No hay entradas en la base de datos</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Medición cancelada</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>El instrumento se movió durante la medición</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Índice no válido</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Error de calibración</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>El instrumento no está sobre la placa blanca o el blanco interno está sucio</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Datos de calibración no válidos</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>No calibrado</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Placa blanca externa demasiado sucia o incorrecta</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Medición interrumpida</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>El usuario ha interrumpido la medición</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Batería baja. Cargue la batería</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Batería agotada. El instrumento se apagará</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Error en el motor del obturador</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>No hay ninguna medición de referencia guardada</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Tiempo de integración espectral sobre blanco demasiado largo</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Desplazamiento de longitud de onda superior al límite de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Poco espacio libre</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problema al cambiar el modo Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problema al buscar redes Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado alta (sensor IR)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Temperatura de la muestra demasiado baja (sensor IR)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Nivel de batería demasiado bajo para actualizar</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Fecha y hora sin configurar</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante la inicialización. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Error de comunicación del hardware. Reinicie el dispositivo</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Error durante la medición</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Diferentes mejores coincidencias para los puntos de control</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>¿Eliminar todas las muestras?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>No</source>
        <translation>No</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrumento bloqueado</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Apagar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Se ha producido un error. Reinicie el instrumento</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>Aceptar</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>Sincronizando datos del trabajo</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Guardar promedio</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Reiniciar trabajo</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Deshacer</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
</context>
</TS>
