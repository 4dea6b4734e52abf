<?php
// Answers with the list of an order's folder.
require __DIR__ . '/lab.php';
header('Content-Type: text/plain; charset=windows-1255');
echo order_list($_GET['tik'] ?? null) ?? 'folder not found';
